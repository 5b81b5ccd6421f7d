// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"

#include <benchmark/benchmark.h>

#include <array>
#include <cstdint>
#include <random>

namespace brindle::bench {

inline constexpr std::array<std::uint64_t, 8> kKinds{
    0x091, 0x891, 0x491, 0x089, 0x489, 0x449, 0x249, 0x0A1,
};

inline CChordLite Chord(std::size_t root, std::uint64_t semitones) {
    return {{static_cast<int>(root % 12), TEnh_Undef}, CKeyEnh_Undef, CSemitones(semitones)};
}

// Any kind on any root.
inline CHarmAnlsChords RandomSong(std::size_t count) {
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
inline CHarmAnlsChords CadenceSong(std::size_t count) {
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

inline void CountChords(benchmark::State& state) {
    const auto chords = static_cast<double>(state.range(0));
    state.counters["time/chord"] = benchmark::Counter(
        chords, benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
}

using TMakeSong = CHarmAnlsChords (*)(std::size_t count);

}  // namespace brindle::bench
