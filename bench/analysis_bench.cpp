// SPDX-License-Identifier: MIT
// What a user waits for when a chord text is analysed, on each route and for several kinds of
// texts, and how the time grows with the length of the text.
#include "bench/GrowthReporter.h"
#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/analysis/TChordStringParse.h"

#include <benchmark/benchmark.h>
#include <array>
#include <cstdint>
#include <cstdio>
#include <map>
#include <random>
#include <string>
#include <string_view>

namespace {

using namespace brindle;

constexpr std::array<std::string_view, 12> kRoots = {"C",  "Db", "D",  "Eb", "E",  "F",
                                                     "F#", "G",  "Ab", "A",  "Bb", "B"};

/// Texts of a number of chords; the seed is fixed, so a text is the same in every run.
class CTexts {
public:
    /// Each chord on any root with any of twelve qualities.
    static std::string Random(std::size_t count) {
        constexpr std::array<std::string_view, 12> qualities = {
            "", "m", "7", "m7", "maj7", "m7b5", "dim", "sus4", "6", "9", "7b9", "aug"};
        return Make(count, [&](std::mt19937& random, std::size_t) {
            return Symbol(random() % 12, qualities[random() % 12]);
        });
    }
    /// II V I in a new key every three chords.
    static std::string ChangingKeys(std::size_t count) {
        std::size_t key = 0;
        return Make(count, [key](std::mt19937& random, std::size_t n) mutable {
            if (n % 3 == 0) key = random() % 12;
            if (n % 3 == 0) return Symbol(key + 2, "m7");
            return n % 3 == 1 ? Symbol(key + 7, "7") : Symbol(key, "");
        });
    }
    /// The seven chords of C major.
    static std::string OneKey(std::size_t count) {
        constexpr std::array<std::string_view, 7> chords = {"C", "Dm", "Em",  "F",
                                                            "G", "Am", "Bdim"};
        return Make(count, [&](std::mt19937& random, std::size_t) {
            return std::string(chords[random() % 7]);
        });
    }
    static std::string TwoChords(std::size_t count) {
        return Make(count, [](std::mt19937&, std::size_t n) { return n % 2 == 0 ? "C" : "F"; });
    }
    static std::string OneChord(std::size_t count) {
        return Make(count, [](std::mt19937&, std::size_t) { return "C"; });
    }
    /// Suspended chords begin no progression.
    static std::string NoMatch(std::size_t count) {
        return Make(
            count, [](std::mt19937& random, std::size_t) { return Symbol(random() % 12, "sus4"); });
    }
    /// A few matches in many chords that every center tolerates.
    static std::string MostlyUndefined(std::size_t count) {
        return Make(count, [](std::mt19937& random, std::size_t n) {
            return n % 50 < 2 ? Symbol(random() % 12, "") : std::string("nochord");
        });
    }

private:
    static std::string Symbol(std::size_t key, std::string_view quality) {
        return std::string(kRoots[key % 12]).append(quality);
    }
    template <class Next>
    static std::string Make(std::size_t count, Next next) {
        std::mt19937 random(64);
        std::string text;
        for (std::size_t n = 0; n < count; ++n) text.append(next(random, n)).append(" ");
        return text;
    }
};

using TMakeText = std::string (*)(std::size_t count);

void CountChords(benchmark::State& state, std::size_t count) {
    state.counters["chords/s"] = benchmark::Counter(static_cast<double>(count),
                                                    benchmark::Counter::kIsIterationInvariantRate);
}

void CheckResult(benchmark::State& state, const CHarmonicAnalyse& analysis) {
    if (analysis.mSignKeys.empty() || analysis.mSignKeys.front().mHarmCenters.empty()) {
        state.SkipWithError("the analysis found nothing");
    }
}

/// From the chords, without reading the text.
void AnalyseChords(benchmark::State& state, TMakeText makeText, TAnalyse route) {
    const auto count = static_cast<std::size_t>(state.range(0));
    const CHarmAnlsChords chords(makeText(count), TChordStringParse{});
    CHarmonicAnalyse analysis;
    for (auto _ : state) {
        analysis.AnalyseFromChords(chords, {}, route);
        benchmark::DoNotOptimize(analysis.mSignKeys.data());
    }
    CheckResult(state, analysis);
    CountChords(state, count);
}

void AnalyseText(benchmark::State& state, TMakeText makeText, TAnalyse route) {
    const auto count = static_cast<std::size_t>(state.range(0));
    const std::string text = makeText(count);
    const TChordStringParse parse;
    CHarmonicAnalyse analysis;
    for (auto _ : state) {
        analysis.AnalyseFromChordString(text, {}, route, parse);
        benchmark::DoNotOptimize(analysis.mSignKeys.data());
    }
    CheckResult(state, analysis);
    CountChords(state, count);
}

/// Chords in a center that a host filled by hand: the tonic route walks from center to center.
void AnalyseFilledCenter(benchmark::State& state, TMakeText makeText) {
    const auto count = static_cast<std::size_t>(state.range(0));
    CHarmAnlsSignKey signKey;
    signKey.mHarmCenters.emplace_back().mChords =
        CHarmAnlsChords(makeText(count), TChordStringParse{});
    CHarmonicAnalyse analysis;
    for (auto _ : state) {
        analysis.mSignKeys = {signKey};
        analysis.Analyse(TAnalyse_TonicProgressions);
        benchmark::DoNotOptimize(analysis.mSignKeys.data());
    }
    CheckResult(state, analysis);
    CountChords(state, count);
}

void WholeText(benchmark::State& state) {
    const CHarmAnlsChords chords(CTexts::ChangingKeys(64), TChordStringParse{});
    CHarmonicAnalyse analysis;
    analysis.AnalyseFromChords(chords, {}, TAnalyse_TonicProgressions);
    for (auto _ : state) {
        std::ostringstream stream;
        analysis.AppendJSONString(stream);
        benchmark::DoNotOptimize(stream);
    }
}

void RegisterAll() {
    using benchmark::RegisterBenchmark;
    const auto registerLengths = [](const std::string& name, auto function, auto... arguments) {
        RegisterBenchmark(name.c_str(), function, arguments...)
            ->Arg(64)
            ->Arg(1000)
            ->Arg(10000)
            ->Arg(100000)
            ->Unit(benchmark::kMicrosecond);
    };
    constexpr std::array<std::pair<const char*, TMakeText>, 7> texts = {{
        {"random", CTexts::Random},
        {"changing keys", CTexts::ChangingKeys},
        {"one key", CTexts::OneKey},
        {"two chords", CTexts::TwoChords},
        {"one chord", CTexts::OneChord},
        {"no match", CTexts::NoMatch},
        {"mostly undefined", CTexts::MostlyUndefined},
    }};
    constexpr std::array<std::pair<const char*, TAnalyse>, 3> routes = {{
        {"tonic", TAnalyse_TonicProgressions},
        {"cadence", TAnalyse_CadenceProgressions},
        {"weights", TAnalyse_CenterWeights},
    }};
    for (const auto& [routeName, route] : routes) {
        for (const auto& [textName, text] : texts) {
            registerLengths(std::string(routeName) + ", " + textName, AnalyseChords, text, route);
        }
        registerLengths(std::string(routeName) + " from text, random", AnalyseText, CTexts::Random,
                        route);
    }
    for (const auto& [textName, text] : texts) {
        registerLengths(std::string("tonic, filled by hand, ") + textName, AnalyseFilledCenter,
                        text);
    }
    RegisterBenchmark("JSON text of 64 chords", WholeText)->Unit(benchmark::kMicrosecond);
}

}  // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 2;
    RegisterAll();
    brindle::bench::CGrowthReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    reporter.PrintGrowth("chords", 1000);
    return 0;
}
