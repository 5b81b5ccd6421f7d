// SPDX-License-Identifier: MIT
// How long the keys of a song and its numerals take, from ready chords, and that they take the same
// for each chord whatever the length of the song: "time/chord" is to stay below 1000. 64 chords are
// a long song, 100,000 a book.

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/RomanNumeral.h"

#include <benchmark/benchmark.h>

#include <array>
#include <cstdint>
#include <random>
#include <string>

using namespace brindle;

namespace {

constexpr std::array<std::uint64_t, 8> kKinds{
    0x091, 0x891, 0x491, 0x089, 0x489, 0x449, 0x249, 0x0A1,
};

CChordLite Chord(std::size_t root, std::uint64_t semitones) {
    return {{static_cast<int>(root % 12), TEnh_Undef}, CKeyEnh_Undef, CSemitones(semitones)};
}

// Any kind on any root.
CHarmAnlsChords RandomSong(std::size_t count) {
    std::mt19937 random(64);
    CHarmAnlsChords song;
    double position = 0.0;
    for (std::size_t i = 0; i < count; ++i) {
        song.emplace_back(Chord(random() % 12, kKinds[random() % kKinds.size()]), position);
        position += 1.0 + static_cast<double>(random() % 4);
    }
    song.emplace_back(CChordLite_Undef, position);
    return song;
}

// II V I in a new key every three chords.
CHarmAnlsChords CadenceSong(std::size_t count) {
    std::mt19937 random(64);
    CHarmAnlsChords song;
    std::size_t key = 0;
    for (std::size_t i = 0; i < count; ++i) {
        if (i % 3 == 0) key = random() % 12;
        constexpr std::array<std::size_t, 3> degrees{2, 7, 0};
        constexpr std::array<std::uint64_t, 3> kinds{0x489, 0x491, 0x891};
        song.emplace_back(Chord(key + degrees[i % 3], kinds[i % 3]), static_cast<double>(i));
    }
    song.emplace_back(CChordLite_Undef, static_cast<double>(count));
    return song;
}

void CountChords(benchmark::State& state) {
    const auto chords = static_cast<double>(state.range(0));
    state.counters["time/chord"] = benchmark::Counter(
        chords, benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
}

using TMakeSong = CHarmAnlsChords (*)(std::size_t count);

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
