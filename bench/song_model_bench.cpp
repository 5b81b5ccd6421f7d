// SPDX-License-Identifier: MIT
// What a writer of songs waits for: learn, ask what comes next, write a song, save and load, and
// how these times grow with what was learned.
#include "brindle/chords/ReadChordText.h"
#include "brindle/platform/SeededRandom.h"
#include "brindle/song/NextChords.h"
#include "brindle/song/SongModelFile.h"
#include "brindle/song/WriteSong.h"

#include <benchmark/benchmark.h>
#include <cstdint>
#include <map>
#include <memory>
#include <vector>

namespace {

using namespace brindle;

constexpr std::size_t kSongLength = 64;

CChordLite Chord(const char* symbol) {
    return ReadChordText(symbol).mChord;
}

/// Songs of 64 chords of twelve roots and eight kinds, that fall a fifth more often than not.
std::vector<CTaughtSong> Songs(std::size_t chords) {
    constexpr std::uint16_t masks[] = {145, 137, 1169, 1161, 2193, 1097, 73, 161};
    SeededRandom random(1);
    std::vector<CTaughtSong> songs;
    std::uint32_t root = 0;
    for (std::size_t song = 0; song < chords / kSongLength; ++song) {
        CTaughtSong taught{"", "", CSignKeyLite("C major"), 4.0, {}};
        for (std::int32_t chord = 0; chord < static_cast<std::int32_t>(kSongLength); ++chord) {
            root = (root + (random.Below(3) != 0 ? 5 : random.Below(12))) % 12;
            CRelativeChord relative;
            relative.mRoot = static_cast<std::uint8_t>(root);
            relative.mMask = masks[random.Below(8)];
            taught.mChords.push_back({relative, chord * kTicksPerBar, kTicksPerBar, false});
        }
        songs.push_back(std::move(taught));
    }
    return songs;
}

const CSongModel& LearnedModel(std::size_t chords) {
    static std::map<std::size_t, std::unique_ptr<CSongModel>> models;
    auto& model = models[chords];
    if (!model) model = std::make_unique<CSongModel>(Songs(chords));
    return *model;
}

void LearnSongs(benchmark::State& state) {
    const std::vector<CTaughtSong> songs = Songs(static_cast<std::size_t>(state.range(0)));
    for (auto _ : state) benchmark::DoNotOptimize(CSongModel(songs).VocabularySize());
}

void NextOfSong(benchmark::State& state) {
    const CSongModel& model = LearnedModel(static_cast<std::size_t>(state.range(0)));
    const std::vector<CChordLite> chords = {Chord("Dm7"), Chord("G7")};
    for (auto _ : state) benchmark::DoNotOptimize(NextChords(model, chords).mChords.size());
}

void WriteOneSong(benchmark::State& state) {
    const CSongModel& model = LearnedModel(static_cast<std::size_t>(state.range(0)));
    CWriteSongOptions options;
    options.mForm = "AABA";
    for (auto _ : state) {
        ++options.mSeed;
        benchmark::DoNotOptimize(WriteSong(model, options).mSong.mChords.size());
    }
}

void SaveAndLoad(benchmark::State& state) {
    const CSongModel& model = LearnedModel(static_cast<std::size_t>(state.range(0)));
    for (auto _ : state) {
        benchmark::DoNotOptimize(ReadSongModel(SongModelText(model)).mFault.empty());
    }
}

BENCHMARK(LearnSongs)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);
BENCHMARK(NextOfSong)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMicrosecond);
BENCHMARK(WriteOneSong)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);
BENCHMARK(SaveAndLoad)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

}  // namespace

BENCHMARK_MAIN();
