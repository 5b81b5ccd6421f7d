// SPDX-License-Identifier: MIT
// How long it takes to read a song, from ready chords: "time/chord" is to stay below 1 microsecond
// from 1,000 chords on, and 100,000 chords below 11 times the time of 10,000.

#include "GrowthReporter.h"
#include "MadeSongs.h"

#include "brindle/analysis/ReadHarmony.h"

using namespace brindle;
using namespace brindle::bench;

namespace {

// A chain of fifths without an end, so that dominants stand under dominants.
CHarmAnlsChords FifthsSong(std::size_t count) {
    CHarmAnlsChords song;
    for (std::size_t i = 0; i < count; ++i) {
        song.emplace_back(Chord(5 * i, 0x491), static_cast<double>(i));
    }
    song.emplace_back(CChordLite_Undef, static_cast<double>(count));
    return song;
}

void Reading(benchmark::State& state, TMakeSong makeSong) {
    const CHarmAnlsChords song = makeSong(static_cast<std::size_t>(state.range(0)));
    for (auto _ : state) {
        const CSongReading reading = ReadHarmony(song);
        if (reading.mChords.front().mNumeral.empty()) state.SkipWithError("a chord is not read");
        benchmark::DoNotOptimize(reading.mChords.data());
    }
    CountChords(state);
}

BENCHMARK_CAPTURE(Reading, random, RandomSong)->Arg(64)->Arg(1000)->Arg(10000)->Arg(100000);
BENCHMARK_CAPTURE(Reading, cadences, CadenceSong)->Arg(64)->Arg(1000)->Arg(10000)->Arg(100000);
BENCHMARK_CAPTURE(Reading, fifths, FifthsSong)->Arg(64)->Arg(1000)->Arg(10000)->Arg(100000);

}  // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    CGrowthReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    reporter.PrintGrowth("chords", 1000);
}
