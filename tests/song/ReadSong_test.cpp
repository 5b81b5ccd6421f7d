// SPDX-License-Identifier: MIT
#include "brindle/song/ReadSong.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <string>

using namespace brindle;

namespace {

/// "C@0 F@4 end@8", by what was typed.
std::string Shown(const CSong& song) {
    std::string text;
    for (std::size_t i = 0; i < song.mChords.size(); ++i) {
        const bool isEnd = i == song.mSymbols.size();
        text += fmt::format("{}{}@{:.4g}", i > 0 ? " " : "", isEnd ? "end" : song.mSymbols[i],
                            song.mChords[i].mPosition);
    }
    return text;
}

}  // namespace

TEST_CASE("A song in any form becomes chords in time") {
    CHECK(Shown(ReadSong("Dm7 G7 | C . . . |")) == "Dm7@0 G7@1 C@4 end@8");
    CHECK(Shown(ReadSong("(4,C);(2,U);(2,G7)")) == "C@0 U@4 G7@6 end@8");
    CHECK(Shown(ReadSong("*A[T44C^7 |A-7 D7 Z")) == "C^7@0 A-7@4 D7@6 end@8");
    const CSong score = ReadSongFile(BRINDLE_SOURCE_DIR "/examples/scores/frere-jacques.musicxml");
    CHECK(score.mFormat == TSongFormat_MusicXml);
    CHECK(score.mChords.size() > 4);
    CHECK(score.mFaults.empty());
}
