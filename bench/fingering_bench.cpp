// SPDX-License-Identifier: MIT
// How long the fingerings of a chord take to find: over all types and roots on a guitar and a
// ukulele, and in the worst case, 12 strings and 24 frets. Each run checks its own result.

#include "brindle/chords/CChordTypes.h"
#include "brindle/guitarchords/FindFingerings.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <cstddef>
#include <vector>

using namespace brindle;

namespace {

std::vector<CChordLite> AllChords() {
    std::vector<CChordLite> chords;
    for (const CChordType& type : _s_chordTypes().BuiltIn()) {
        const CSemitones tones = type.mIntvls.ToSemitones();
        if (tones.size() < 2) continue;
        for (int root = 0; root < 12; ++root) {
            chords.emplace_back(CKeyEnh{root, TEnh_n}, CKeyEnh_Undef, tones);
        }
    }
    return chords;
}

void Find(benchmark::State& state, const GChShortTuning& tuning, int highestFret) {
    const std::vector<CChordLite> chords = AllChords();
    CFingeringOptions options;
    options.mHighestFret = highestFret;
    std::size_t at = 0;
    std::size_t found = 0;
    for (auto _ : state) {
        found += FindFingerings(chords[at], tuning, options).size();
        at = (at + 1) % chords.size();
    }
    if (found == 0) state.SkipWithError("nothing was found");
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()));
}

BENCHMARK_CAPTURE(Find, guitar, kGChStandardGuitar, 15)->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(Find, ukulele, GChShortTuning{67, 60, 64, 69}, 15)->Unit(benchmark::kMicrosecond);
BENCHMARK_CAPTURE(Find, twelve_strings,
                  GChShortTuning{40, 45, 50, 55, 59, 64, 69, 74, 79, 83, 88, 93}, 24)
    ->Unit(benchmark::kMicrosecond);

}  // namespace

BENCHMARK_MAIN();
