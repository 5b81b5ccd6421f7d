// SPDX-License-Identifier: MIT
// What a user of the sequence model waits for (learn, ask, generate, save, load), how the time
// grows with what was learned, and how much memory a model takes.
#include "bench/GrowthReporter.h"
#include "brindle/markov/VariableLengthMarkovModel.h"
#include "brindle/platform/SeededRandom.h"

#include <benchmark/benchmark.h>
#include <sys/resource.h>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace {

using namespace brindle;
using Helper = VariableLengthMarkovModel::JSONDeserialization_Helper;

constexpr std::uint64_t kOrder = 4;
constexpr std::size_t kSongLength = 64;

/// Symbols of a million songs' kind: twelve roots, eight qualities and four lengths, each followed
/// by any of a few others more often than by the rest, so that the longest histories keep being
/// new.
std::vector<CMarkovObject> Symbols(std::size_t count) {
    constexpr std::uint64_t masks[] = {145, 137, 1169, 1161, 2193, 1097, 73, 161};
    constexpr double lengths[] = {1.0, 2.0, 3.0, 4.0};
    SeededRandom random(1);
    std::vector<CMarkovObject> symbols(count);
    std::uint32_t root = 0;
    for (CMarkovObject& symbol : symbols) {
        root = (root + (random.Below(3) != 0 ? 5 : random.Below(12))) % 12;
        CHarmAnlsChordWithLength& chord = symbol.mChord;
        chord.mRootKeyEnh = {static_cast<int>(root), TEnh_n};
        chord.mRootDistToHarmCenter = static_cast<int>(root);
        chord.mSemitones = CSemitones(masks[random.Below(8)]);
        chord.mLength = lengths[random.Below(4)];
    }
    return symbols;
}

void Learn(VariableLengthMarkovModel& model, const std::vector<CMarkovObject>& symbols) {
    for (std::size_t ix = 0; ix < symbols.size(); ++ix) {
        if (ix % kSongLength == 0) model.StartSequence();
        model.LearnAddSymbol(symbols[ix]);
        if (ix % kSongLength == kSongLength - 1) model.EndSequence();
    }
    model.EndSequence();
}

/// One model of each size for all benchmarks.
VariableLengthMarkovModel& LearnedModel(std::size_t count) {
    static std::map<std::size_t, std::unique_ptr<VariableLengthMarkovModel>> models;
    auto& model = models[count];
    if (!model) {
        model = std::make_unique<VariableLengthMarkovModel>(kOrder);
        Learn(*model, Symbols(count));
        model->SetRandomSource([random = SeededRandom(2)]() mutable { return random.Next(); });
    }
    return *model;
}

std::string ModelPath(std::size_t count) {
    return (std::filesystem::temp_directory_path() /
            ("brindle_markov_bench_" + std::to_string(count) + ".json"))
        .string();
}

std::size_t CountOf(const benchmark::State& state) {
    return static_cast<std::size_t>(state.range(0));
}

void ReportSymbols(benchmark::State& state) {
    state.counters["symbols/s"] = benchmark::Counter(static_cast<double>(CountOf(state)),
                                                     benchmark::Counter::kIsIterationInvariantRate);
}

void BenchLearn(benchmark::State& state) {
    const std::vector<CMarkovObject> symbols = Symbols(CountOf(state));
    std::size_t histories = 0;
    for (auto _ : state) {
        VariableLengthMarkovModel model(kOrder);
        Learn(model, symbols);
        histories = model.mTransitionMap.size();
    }
    state.counters["histories"] = static_cast<double>(histories);
    ReportSymbols(state);
}

/// As many questions as there are symbols: the table behind each window of four.
void BenchQuery(benchmark::State& state) {
    VariableLengthMarkovModel& model = LearnedModel(CountOf(state));
    const MarkovSequence sequence = model.IteratorSequenceForObjects(Symbols(CountOf(state)));
    MarkovProbabilities table;
    std::size_t known = 0;
    for (auto _ : state) {
        for (std::size_t end = kOrder; end <= sequence.size(); ++end) {
            model.ProbabilitiesForNextSymbol(
                MarkovSequenceView(sequence).subspan(end - kOrder, kOrder), table);
            known += table.empty() ? 0U : 1U;
        }
    }
    if (known == 0) state.SkipWithError("no window is known");
    ReportSymbols(state);
}

/// Sixteen bars between two fixed chords.
void BenchGenerate(benchmark::State& state) {
    VariableLengthMarkovModel& model = LearnedModel(CountOf(state));
    CMarkovObject gap = CMarkovObject_Gap;
    gap.mChord.mLength = 64.0;
    TMarkovGenerateOptions options;
    options.mTemplate = model.IteratorSequenceForObjects({gap});
    options.mMaxHistoryLength = kOrder;
    options.mAcceptAtMinHistory = true;
    options.Validate(model);
    for (auto _ : state) {
        TMarkovSampledSequence chosen;
        std::vector<TMarkovSampledSequence> sequences;
        model.SampleSequenceWithLength(chosen, sequences, true, options);
        if (TMarkovSequenceLengthInBeats(chosen.mSymbols) != 64.0) {
            state.SkipWithError("no sequence was made");
            break;
        }
    }
}

void BenchSave(benchmark::State& state) {
    const VariableLengthMarkovModel& model = LearnedModel(CountOf(state));
    for (auto _ : state) {
        if (!model.SaveToFile(ModelPath(CountOf(state)))) state.SkipWithError("not written");
    }
    state.counters["bytes"] =
        static_cast<double>(std::filesystem::file_size(ModelPath(CountOf(state))));
    ReportSymbols(state);
}

void BenchLoad(benchmark::State& state) {
    const VariableLengthMarkovModel& saved = LearnedModel(CountOf(state));
    const std::string path = ModelPath(CountOf(state));
    if (!saved.SaveToFile(path)) state.SkipWithError("not written");
    for (auto _ : state) {
        VariableLengthMarkovModel model;
        Helper::VariableLengthMarkovModelFromJSONFile(path, model);
        if (model.mTransitionMap.size() != saved.mTransitionMap.size()) {
            state.SkipWithError("the model that was read differs");
            break;
        }
    }
    std::filesystem::remove(path);
    ReportSymbols(state);
}

void Register(const char* name, void (*function)(benchmark::State&)) {
    benchmark::RegisterBenchmark(name, function)
        ->Arg(10000)
        ->Arg(100000)
        ->Arg(1000000)
        ->Unit(benchmark::kMillisecond);
}

/// The most memory that the process took so far, in megabytes.
double PeakMegabytes() {
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return static_cast<double>(usage.ru_maxrss) / 1024.0;
}

}  // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 2;
    {
        VariableLengthMarkovModel model(kOrder);
        const double before = PeakMegabytes();
        Learn(model, Symbols(1'000'000));
        std::printf("a model of 1,000,000 symbols at order 4: %zu histories, %.0f MB\n",
                    model.mTransitionMap.size(), PeakMegabytes() - before);
    }
    Register("learn", BenchLearn);
    Register("query", BenchQuery);
    Register("generate 16 bars", BenchGenerate);
    Register("save", BenchSave);
    Register("load", BenchLoad);
    brindle::bench::CGrowthReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    reporter.PrintGrowth("symbols", 10000);
    return 0;
}
