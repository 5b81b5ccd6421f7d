// SPDX-License-Identifier: MIT
// How long it takes to name notes as players say them, beside the search for a root by the net and
// by the score: chords of three to six notes in all keys, without and with a key and neighbours.

#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/NameNotes.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <benchmark/benchmark.h>

#include <cstddef>
#include <vector>

using namespace brindle;

namespace {

/// Triads, sevenths, a ninth, a thirteenth and a cluster over all keys and in inversions.
std::vector<std::vector<CNote>> Sets() {
    const std::vector<std::vector<int>> shapes{{0, 4, 7},          {4, 7, 12},
                                               {0, 3, 7, 10},      {4, 7, 10, 12},
                                               {0, 4, 10, 14, 19}, {0, 4, 10, 14, 18, 21},
                                               {2, 12, 16, 19},    {0, 1, 2, 3}};
    std::vector<std::vector<CNote>> sets;
    for (const auto& shape : shapes) {
        for (int root = 48; root < 60; ++root) {
            std::vector<CNote>& set = sets.emplace_back();
            for (const int tone : shape) set.emplace_back(root + tone, TEnh_Undef);
        }
    }
    return sets;
}

void Run(benchmark::State& state, const CNamingOptions& options) {
    const auto sets = Sets();
    std::size_t ix = 0;
    for (auto _ : state) {
        const auto names = NameNotes(sets[ix], options);
        if (names.empty() || names.size() > options.mLimit) state.SkipWithError("no name");
        ix = (ix + 1) % sets.size();
    }
}

void FirstName(benchmark::State& state) {
    CNamingOptions options;
    options.mLimit = 1;
    Run(state, options);
}
BENCHMARK(FirstName);

void ThreeNames(benchmark::State& state) {
    CNamingOptions options;
    options.mLimit = 3;
    Run(state, options);
}
BENCHMARK(ThreeNames);

void TwelveNames(benchmark::State& state) {
    Run(state, {});
}
BENCHMARK(TwelveNames);

void FirstNameInKeyBetweenNeighbours(benchmark::State& state) {
    CNamingOptions options;
    options.mLimit = 1;
    options.mKey = {CKeyEnh_C, TSignKeyType_Major};
    options.mPreviousRoot = 2;
    options.mNextRoot = 0;
    Run(state, options);
}
BENCHMARK(FirstNameInKeyBetweenNeighbours);

void Progression(benchmark::State& state) {
    const auto sets = Sets();
    for (auto _ : state) {
        CNamingOptions options;
        options.mLimit = 1;
        if (NameProgression(sets, options).size() != sets.size()) state.SkipWithError("no names");
    }
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(sets.size()));
}
BENCHMARK(Progression);

/// The root by the net or by the score, and the name on it.
void RootAndName(benchmark::State& state, TSingleChordAnalysisAlgo algo) {
    const auto sets = Sets();
    const CChordNamePrefs prefs;
    std::size_t ix = 0;
    for (auto _ : state) {
        CChordHeavy chord;
        chord.SetFromNoteSet({sets[ix].begin(), sets[ix].end()});
        chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
        if (chord.NameWithSlash(prefs).empty()) state.SkipWithError("no name");
        ix = (ix + 1) % sets.size();
    }
}
BENCHMARK_CAPTURE(RootAndName, score, TSingleChordAnalysisAlgo_Score);
BENCHMARK_CAPTURE(RootAndName, net, TSingleChordAnalysisAlgo_NeuronalNet);

}  // namespace

BENCHMARK_MAIN();
