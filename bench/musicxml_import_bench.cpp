// SPDX-License-Identifier: MIT
// How long the import of a score takes, beside one parse of the same bytes into a tree by the XML
// library, measured in turns in the same run. "ratio" is the import through the parse and must stay
// below 2.5; "growth" is the import of 40,000 measures through that of 4,000 and must stay
// below 11. One long part, and many parts of ten measures.

#include "brindle/musicxml/MusicXmlParser.h"
#include "brindle/platform/XmlDocument.h"

#include <benchmark/benchmark.h>
#include <algorithm>
#include <ctime>
#include <map>
#include <memory>
#include <string>
#include <variant>
#include <vector>

using namespace brindle;

namespace {

constexpr int kNotesInMeasure =
    6;  // four quarters, the first tied to the last, one more in a chord
constexpr int kDeliveredInMeasure = 5;
constexpr int kRuns = 5;

using Text = std::string;

Text Note(char step, int octave, const Text& before = "", const Text& tie = "") {
    return "      <note default-x=\"12.5\" default-y=\"-40\">\n        " + before +
           "<pitch>\n          <step>" + step + "</step>\n          <octave>" +
           std::to_string(octave) +
           "</octave>\n        </pitch>\n        <duration>2</duration>\n" + tie +
           "        <voice>1</voice>\n        <type>quarter</type>\n"
           "        <stem default-y=\"4\">up</stem>\n      </note>\n";
}

Text Measure(int number) {
    Text text = "    <measure number=\"" + std::to_string(number) + "\" width=\"180.5\">\n";
    if (number == 1) {
        text +=
            "      <attributes><divisions>2</divisions><key><fifths>-1</fifths></key>"
            "<time><beats>4</beats><beat-type>4</beat-type></time>"
            "<clef><sign>G</sign><line>2</line></clef></attributes>\n";
    }
    return text + Note('C', 4) + Note('E', 4, "<chord/>") +
           Note('G', 4, "", "        <tie type=\"start\"/>\n") +
           Note('G', 4, "", "        <tie type=\"stop\"/>\n") + Note('B', 4) +
           Note(static_cast<char>('A' + number % 7), 3) + "    </measure>\n";
}

Text Score(int parts, int measuresInPart) {
    Text text = "<?xml version=\"1.0\"?>\n<score-partwise version=\"4.0\">\n  <part-list>\n";
    for (int part = 1; part <= parts; ++part) {
        const Text id = "P" + std::to_string(part);
        text += "    <score-part id=\"" + id + "\"><part-name>Part " + id +
                "</part-name><score-instrument id=\"" + id +
                "-I1\"><instrument-name>Piano</instrument-name></score-instrument>"
                "</score-part>\n";
    }
    text += "  </part-list>\n";
    for (int part = 1; part <= parts; ++part) {
        text += "  <part id=\"P" + std::to_string(part) + "\">\n";
        for (int number = 1; number <= measuresInPart; ++number) text += Measure(number);
        text += "  </part>\n";
    }
    return text += "</score-partwise>\n";
}

// Time of the processor, so that other work of the machine does not count.
template <class Step>
double Seconds(Step step) {
    const std::clock_t begin = std::clock();
    step();
    return static_cast<double>(std::clock() - begin) / CLOCKS_PER_SEC;
}

double Median(std::vector<double> values) {
    std::sort(values.begin(), values.end());
    return values[values.size() / 2];
}

// The import of a tenth of the score, by the way the score is cut into parts.
std::map<bool, double>& SecondsOfTenth() {
    static std::map<bool, double> seconds;
    return seconds;
}

void Import(benchmark::State& state, bool hasManyParts) {
    const int measures = static_cast<int>(state.range(0));
    const Text text = hasManyParts ? Score(measures / 10, 10) : Score(1, measures);
    std::int64_t notes = 0;
    const auto host = std::make_shared<MusicXmlParserDelegate>();
    host->didEncounterNote = [&notes](const CMuxmlNote&) { ++notes; };
    std::vector<double> imports;
    std::vector<double> parses;
    for (auto _ : state) {
        parses.push_back(Seconds([&text] {
            const auto document = XmlDocument::FromBytes(text);
            benchmark::DoNotOptimize(std::get<XmlDocument>(document).rootElement());
        }));
        notes = 0;
        imports.push_back(Seconds([&] { MusicXmlParser().parseBytes(text, host); }));
        state.SetIterationTime(imports.back());
    }
    if (notes != std::int64_t{measures} * kDeliveredInMeasure) {
        state.SkipWithError("wrong number of notes");
        return;
    }
    const double seconds = Median(imports);
    state.counters["ratio"] = seconds / Median(parses);
    double& tenth = SecondsOfTenth()[hasManyParts];
    if (tenth > 0) state.counters["growth"] = seconds / tenth;
    tenth = seconds;
    const auto size = static_cast<std::int64_t>(text.size());
    state.SetBytesProcessed(static_cast<std::int64_t>(state.iterations()) * size);
    state.counters["notes"] = benchmark::Counter(
        static_cast<double>(measures) * kNotesInMeasure * static_cast<double>(state.iterations()),
        benchmark::Counter::kIsRate);
}

BENCHMARK_CAPTURE(Import, one_long_part, false)
    ->Arg(4'000)
    ->Arg(40'000)
    ->Iterations(kRuns)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(Import, many_small_parts, true)
    ->Arg(4'000)
    ->Arg(40'000)
    ->Iterations(kRuns)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);

}  // namespace

BENCHMARK_MAIN();
