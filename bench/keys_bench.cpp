// SPDX-License-Identifier: MIT
// How long the keys of a song and its numerals take, from ready chords, and that they take the same
// for each chord whatever the length of the song: "time/chord" is to stay below 1000. 64 chords are
// a long song, 100,000 a book.

#include "MadeSongs.h"

#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/RomanNumeral.h"

#include <string>

using namespace brindle;
using namespace brindle::bench;

namespace {

void Keys(benchmark::State& state, TMakeSong makeSong) {
    const CHarmAnlsChords song = makeSong(static_cast<std::size_t>(state.range(0)));
    for (auto _ : state) {
        const CKeyOfSong keys = FindKeys(song);
        if (keys.mRegions.empty()) state.SkipWithError("a song has no key");
        benchmark::DoNotOptimize(keys.mConfidence);
    }
    CountChords(state);
}

void Numerals(benchmark::State& state, TMakeSong makeSong) {
    const CHarmAnlsChords song = makeSong(static_cast<std::size_t>(state.range(0)));
    const CKeyOfSong keys = FindKeys(song);
    for (auto _ : state) {
        const auto numerals = NumeralsOf(song, keys);
        if (numerals.front().empty()) state.SkipWithError("a chord has no numeral");
        benchmark::DoNotOptimize(numerals.data());
    }
    CountChords(state);
}

BENCHMARK_CAPTURE(Keys, random, RandomSong)->Arg(64)->Arg(1000)->Arg(10000)->Arg(100000);
BENCHMARK_CAPTURE(Keys, cadences, CadenceSong)->Arg(64)->Arg(1000)->Arg(10000)->Arg(100000);
BENCHMARK_CAPTURE(Numerals, cadences, CadenceSong)->Arg(64)->Arg(100000);

}  // namespace

BENCHMARK_MAIN();
