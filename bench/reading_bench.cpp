// SPDX-License-Identifier: MIT
// How long it takes to read a song, from ready chords: "time/chord" is to stay below 1 microsecond
// from 1,000 chords on, and 100,000 chords below 11 times the time of 10,000.

#include "GrowthReporter.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/ReadHarmony.h"

#include <array>
#include <cstdint>
#include <random>

using namespace brindle;

namespace {

constexpr std::array<std::uint64_t, 10> kKinds{
    0x091, 0x891, 0x491, 0x089, 0x489, 0x449, 0x249, 0x0A1, 0x111, 0x291,
};

CChordLite Chord(std::size_t root, std::uint64_t semitones) {
    return {{static_cast<int>(root % 12), TEnh_Undef}, CKeyEnh_Undef, CSemitones(semitones)};
}

// Any kind on any root, some with a bass.
CHarmAnlsChords RandomSong(std::size_t count) {
    std::mt19937 random(15);
    CHarmAnlsChords song;
    double position = 0.0;
    for (std::size_t i = 0; i < count; ++i) {
        CChordLite chord = Chord(random() % 12, kKinds[random() % kKinds.size()]);
        if (random() % 5 == 0) {
            chord.mBassKeyEnh = {static_cast<int>(random() % 12), TEnh_Undef};
        }
        song.emplace_back(chord, position);
        position += 1.0 + static_cast<double>(random() % 4);
    }
    song.emplace_back(CChordLite_Undef, position);
    return song;
}

// ii V I in a new key every three chords.
CHarmAnlsChords CadenceSong(std::size_t count) {
    std::mt19937 random(15);
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

// A chain of fifths without an end, so that dominants stand under dominants.
CHarmAnlsChords FifthsSong(std::size_t count) {
    CHarmAnlsChords song;
    for (std::size_t i = 0; i < count; ++i) {
        song.emplace_back(Chord(5 * i, 0x491), static_cast<double>(i));
    }
    song.emplace_back(CChordLite_Undef, static_cast<double>(count));
    return song;
}

using TMakeSong = CHarmAnlsChords (*)(std::size_t count);

void Reading(benchmark::State& state, TMakeSong makeSong) {
    const CHarmAnlsChords song = makeSong(static_cast<std::size_t>(state.range(0)));
    for (auto _ : state) {
        const CSongReading reading = ReadHarmony(song);
        if (reading.mChords.front().mNumeral.empty()) state.SkipWithError("a chord is not read");
        benchmark::DoNotOptimize(reading.mChords.data());
    }
    const auto chords = static_cast<double>(state.range(0));
    state.counters["time/chord"] = benchmark::Counter(
        chords, benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
}

BENCHMARK_CAPTURE(Reading, random, RandomSong)->Arg(64)->Arg(1000)->Arg(10000)->Arg(100000);
BENCHMARK_CAPTURE(Reading, cadences, CadenceSong)->Arg(64)->Arg(1000)->Arg(10000)->Arg(100000);
BENCHMARK_CAPTURE(Reading, fifths, FifthsSong)->Arg(64)->Arg(1000)->Arg(10000)->Arg(100000);

}  // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    brindle::bench::CGrowthReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    reporter.PrintGrowth("chords", 1000);
}
