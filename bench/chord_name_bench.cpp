// SPDX-License-Identifier: MIT
// How long the name of a chord takes: the mean over all roots for chords of four notes, plain and
// over a bass that has to be spelled by the scale of the chord.

#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <benchmark/benchmark.h>

#include <cstddef>
#include <string>
#include <vector>

using namespace brindle;

namespace {

/// The chord on each of the twelve keys, `bassIntvl` semitones above which its bass stands.
std::vector<CChordHeavy> OnAllRoots(CSemitones semitones, int bassIntvl) {
    std::vector<CChordHeavy> chords;
    for (int keyNr = 0; keyNr < 12; ++keyNr) {
        const CKeyEnh root{keyNr, MakeSensefulEnhForKeyNrAssumingCMajor(keyNr, TEnh_Undef)};
        const CKeyEnh bass{FoldIntoOctave(keyNr + bassIntvl), TEnh_n};
        chords.emplace_back(root, semitones, bass);
    }
    return chords;
}

void NameChords(benchmark::State& state, CSemitones semitones, int bassIntvl) {
    const CChordNamePrefs prefs;
    const std::vector<CChordHeavy> chords = OnAllRoots(semitones, bassIntvl);
    std::size_t ix = 0;
    for (auto _ : state) {
        const std::string name = chords[ix].Name(prefs);
        benchmark::DoNotOptimize(name.data());
        const bool hasSlash = name.find('/') != std::string::npos;
        if (hasSlash != (bassIntvl != 0)) state.SkipWithError("a slash too many or too few");
        ix = ix + 1 < chords.size() ? ix + 1 : 0;
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()));
}
BENCHMARK_CAPTURE(NameChords, minor_seventh, CSemitones{0, 3, 7, 10}, 0);
BENCHMARK_CAPTURE(NameChords, major_seventh, CSemitones{0, 4, 7, 11}, 0);
BENCHMARK_CAPTURE(NameChords, seventh_over_its_third, CSemitones{0, 4, 7, 10}, 4);

}  // namespace

BENCHMARK_MAIN();
