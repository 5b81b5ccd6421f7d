// SPDX-License-Identifier: MIT
// How long a large score takes to read as a lead sheet, beside what the XML library alone needs for
// the same bytes: one streaming parse with callbacks that do nothing. "ratio" is the first divided
// by the second, measured in turn in the same run; it shall stay below 1.5.

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/platform/AtomicFile.h"

#include <benchmark/benchmark.h>
#include <fmt/format.h>
#include <libxml/SAX2.h>
#include <libxml/parserInternals.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <ctime>
#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

namespace {

using namespace brindle;

constexpr int kMeasures = 4000;

std::string Note(int n) {
    constexpr std::string_view steps = "CDEFGAB";
    return fmt::format(
        "      <note default-x=\"{}.25\" default-y=\"-{}.00\">\n        <pitch>\n          <step>{}"
        "</step>\n          <octave>{}</octave>\n          </pitch>\n        "
        "<duration>2</duration>\n"
        "        <voice>1</voice>\n        <type>quarter</type>\n        <stem>up</stem>\n"
        "        <lyric number=\"1\">\n          <syllabic>single</syllabic>\n          <text>la"
        "</text>\n          </lyric>\n        </note>\n",
        n % 400, n % 40, steps[static_cast<std::size_t>(n % 7)], 3 + n % 3);
}

std::string Harmony(int n) {
    constexpr std::array<std::string_view, 4> kinds = {"major", "minor-seventh", "dominant",
                                                       "major-seventh"};
    return fmt::format(
        "      <harmony print-frame=\"no\">\n        <root>\n          <root-step>{}</root-step>\n"
        "          </root>\n        <kind text=\"\">{}</kind>\n        </harmony>\n",
        "CDEFGAB"[n % 7], kinds[static_cast<std::size_t>(n % 4)]);
}

/// A melody of four notes a bar under two chords a bar, as programs for scores write it.
const std::string& LargeScore() {
    static const std::string score = [] {
        std::string text =
            "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<score-partwise version=\"4.0\">\n"
            "  <movement-title>Large</movement-title>\n  <part id=\"P1\">\n";
        for (int n = 0; n < kMeasures; ++n) {
            text += fmt::format("    <measure number=\"{}\" width=\"240.11\">\n", n + 1);
            if (n == 0) {
                text +=
                    "      <attributes>\n        <divisions>2</divisions>\n        <key>\n"
                    "          <fifths>0</fifths>\n          <mode>major</mode>\n          </key>\n"
                    "        <time>\n          <beats>4</beats>\n          "
                    "<beat-type>4</beat-type>\n"
                    "          </time>\n        </attributes>\n";
            }
            for (int beat = 0; beat < 4; ++beat) {
                if (beat % 2 == 0) text += Harmony(n + beat);
                text += Note(n * 4 + beat);
            }
            text += "      </measure>\n";
        }
        return text + "  </part>\n</score-partwise>\n";
    }();
    return score;
}

class CScoreFile {
public:
    CScoreFile()
        : mPath((std::filesystem::temp_directory_path() /
                 fmt::format("brindle_bench_{}.musicxml", getpid()))
                    .string()) {
        mIsWritten = WriteFileAtomically(mPath, LargeScore());
    }
    CScoreFile(const CScoreFile&) = delete;
    CScoreFile& operator=(const CScoreFile&) = delete;
    ~CScoreFile() { std::filesystem::remove(mPath); }

    [[nodiscard]] const std::string& Path() const { return mPath; }
    [[nodiscard]] bool IsWritten() const { return mIsWritten; }

private:
    std::string mPath;
    bool mIsWritten = false;
};

bool ParseWithEmptyCallbacks(const std::string& bytes) {
    xmlParserCtxtPtr context =
        xmlCreateMemoryParserCtxt(bytes.data(), static_cast<int>(bytes.size()));
    xmlCtxtUseOptions(context, XML_PARSE_NOENT | XML_PARSE_NONET);
    xmlSAXHandler& handler = *context->sax;
    handler.startElementNs = [](void*, const xmlChar*, const xmlChar*, const xmlChar*, int,
                                const xmlChar**, int, int, const xmlChar**) {};
    handler.endElementNs = [](void*, const xmlChar*, const xmlChar*, const xmlChar*) {};
    handler.characters = handler.ignorableWhitespace = [](void*, const xmlChar*, int) {};
    xmlParseDocument(context);
    const bool isWellFormed = context->wellFormed != 0;
    if (context->myDoc != nullptr) xmlFreeDoc(context->myDoc);
    context->myDoc = nullptr;
    xmlFreeParserCtxt(context);
    return isWellFormed;
}

// Of the processor, so that other programs on the machine count little.
template <class TFunction>
double SecondsOf(const TFunction& function) {
    const std::clock_t start = std::clock();
    function();
    return static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC;
}

double Median(std::vector<double> numbers) {
    const auto middle = numbers.begin() + static_cast<std::ptrdiff_t>(numbers.size() / 2);
    std::nth_element(numbers.begin(), middle, numbers.end());
    return *middle;
}

void LoadAgainstBareParse(benchmark::State& state) {
    const CScoreFile file;
    if (!file.IsWritten()) return state.SkipWithError("the score cannot be written");
    std::vector<double> loads;
    std::vector<double> parses;
    for (auto _ : state) {
        bool isRight = true;
        TMusicXMLDoc doc;
        loads.push_back(SecondsOf([&] { isRight &= doc.LoadFromMusicXMLFile(file.Path()); }));
        parses.push_back(SecondsOf([&] { isRight &= ParseWithEmptyCallbacks(LargeScore()); }));
        if (!isRight || doc.Harmonies.size() != std::size_t{2} * kMeasures) {
            return state.SkipWithError("the score is read wrong");
        }
    }
    if (loads.empty()) return;
    state.counters["load_ms"] = Median(loads) * 1000;
    state.counters["bare_parse_ms"] = Median(parses) * 1000;
    state.counters["ratio"] = Median(loads) / Median(parses);
}
BENCHMARK(LoadAgainstBareParse)->Unit(benchmark::kMillisecond)->MinTime(3.0);

void LoadAsPlayed(benchmark::State& state) {
    for (auto _ : state) {
        TMusicXMLDoc doc;
        if (!doc.LoadAsPlayedFromBytes(LargeScore())) {
            return state.SkipWithError("the score is read wrong");
        }
        benchmark::DoNotOptimize(doc);
    }
    state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(LargeScore().size()));
}
BENCHMARK(LoadAsPlayed)->Unit(benchmark::kMillisecond);

}  // namespace

BENCHMARK_MAIN();
