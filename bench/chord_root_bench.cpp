// SPDX-License-Identifier: MIT
// How long it takes to find the root of a chord, by the score and by the net: the points or the
// forward pass alone, and the whole call, which also spells the chord by its new root. Usual chords
// in all keys and inversions; that each root is right is checked.

#include "brindle/chords/CChordHeavy.h"
#include "brindle/neural/NetForSingleChordAnalysis.h"

#include <benchmark/benchmark.h>

#include <cstddef>
#include <vector>

using namespace brindle;

namespace {

struct CChord {
    CChordHeavy mChord;
    int mRootKeyNr;
};

/// Major and minor triads and dominant sevenths in all keys and inversions.
std::vector<CChord> Chords() {
    std::vector<CChord> chords;
    for (const CIntvlSet& shape :
         {CIntvlSet(0, 4, 7), CIntvlSet(0, 3, 7), CIntvlSet(0, 4, 7, 10)}) {
        for (int root = 48; root < 60; ++root) {
            CMySet<unsigned char> noteNrs;
            for (const int intvl : shape) noteNrs.insert(static_cast<unsigned char>(root + intvl));
            CChordHeavy chord;
            chord.SetFromNoteNrSet(noteNrs);
            for (std::size_t inversion = 0; inversion < shape.size(); ++inversion) {
                chords.push_back({chord, root % 12});
                chord.Invert();
            }
        }
    }
    return chords;
}

void PointsOfAllKeys(benchmark::State& state) {
    const std::vector<CChord> chords = Chords();
    std::size_t ix = 0;
    int sum = 0;
    for (auto _ : state) {
        const CChordHeavy& chord = chords[ix].mChord;
        for (int keyNr = 0; keyNr < 12; ++keyNr) {
            sum += chord.ProbThatNoteIsRootNote(CNote(keyNr, TEnh_n));
        }
        ix = (ix + 1) % chords.size();
    }
    if (sum == 0) state.SkipWithError("no points");
}
BENCHMARK(PointsOfAllKeys);

void DecideByNet(benchmark::State& state) {
    NeuronalNet& net = NetForSingleChordAnalysis();
    std::vector<double> inputs(24, 0.0);
    inputs[0] = inputs[4] = inputs[19] = 1.0;
    for (auto _ : state) {
        net.use(inputs);
        std::size_t winner = net.winner();
        benchmark::DoNotOptimize(winner);
        if (winner != 0) state.SkipWithError("another root");
    }
}
BENCHMARK(DecideByNet);

void FindAndSpell(benchmark::State& state, TSingleChordAnalysisAlgo algo) {
    const std::vector<CChord> chords = Chords();
    std::size_t ix = 0;
    int wrong = 0;
    for (auto _ : state) {
        CChordHeavy chord = chords[ix].mChord;
        chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(algo);
        wrong += chord.RootNote().KeyNr() != chords[ix].mRootKeyNr;
        ix = (ix + 1) % chords.size();
    }
    if (wrong != 0) state.SkipWithError("another root");
}
BENCHMARK_CAPTURE(FindAndSpell, score, TSingleChordAnalysisAlgo_Score);
BENCHMARK_CAPTURE(FindAndSpell, net, TSingleChordAnalysisAlgo_NeuronalNet);

}  // namespace

BENCHMARK_MAIN();
