// SPDX-License-Identifier: MIT
#include "brindle/present/WrittenSongText.h"

#include "brindle/present/ChordProText.h"
#include "brindle/song/BuiltInSongs.h"
#include "brindle/song/ReadSong.h"
#include "brindle/song/SongRequest.h"

#include <doctest/doctest.h>

#include <set>
#include <string>
#include <utility>
#include <vector>

namespace {

using namespace brindle;

/// Where each chord begins, and its symbol; a chord that is written twice in a row is one.
std::vector<std::pair<double, std::string>> ChordsOf(const CSong& song) {
    std::vector<std::pair<double, std::string>> chords;
    for (std::size_t ix = 0; ix + 1 < song.mChords.size(); ++ix) {
        if (!chords.empty() && chords.back().second == song.mSymbols[ix]) continue;
        chords.emplace_back(song.mChords[ix].mPosition, song.mSymbols[ix]);
    }
    return chords;
}

}  // namespace

TEST_CASE("Chords that share a bar by seven begin at the nearest ticks, without gaps") {
    const CSong song = ReadSong("C D E F G Am Bb | C", {.mEven = true});
    std::string ticks;
    const CMidiPiece piece = MidiPieceOfSong(song, 120.0);
    for (const CMidiNote& note : piece.mTracks[1].mNotes) {
        ticks += std::to_string(note.mTick) + "+" + std::to_string(note.mDuration) + " ";
    }
    CHECK(ticks == "0+274 274+275 549+274 823+274 1097+274 1371+275 1646+274 1920+1920 ");
}

TEST_CASE("Of five tones the right hand leaves the root to the bass") {
    const CMidiPiece piece = MidiPieceOfSong(ReadSong("C9"), 120.0);
    std::set<int> tones;
    for (const CMidiNote& note : piece.mTracks[0].mNotes) tones.insert(note.mNoteNr % 12);
    CHECK(tones == std::set<int>{2, 4, 7, 10});
    CHECK(piece.mTracks[1].mNotes.at(0).mNoteNr == 48);
}

TEST_CASE("An upbeat fills its bar from behind in ChordPro") {
    CHECK(ChordProText(ReadSong("Time Signature: 3/4\nm0 b3 C: V\nm1 I\nm2 V7 b3 I\n")) ==
          "{key: C major}\n{time: 3/4}\n{start_of_grid}\n"
          "| N.C. . G | C . . | G7 . C |\n{end_of_grid}\n");
}

TEST_CASE("A written song reads back from its text, with its parts") {
    const CSongModel model = BuiltInSongModel();
    for (const char* const form : {"AABA", "ABAC", "blues", ""}) {
        for (const int beats : {2, 3, 4, 6}) {
            CSongRequest request;
            request.mForm = form;
            request.mBeatsPerBar = beats;
            CSongRequestReading read = ReadSongRequest(request);
            read.mOptions.mSeed = static_cast<std::uint64_t>(beats);
            const CWrittenSong written = WriteSong(model, read.mOptions);
            REQUIRE(written.mFault == "");
            CSongOptions options;
            options.mBeatsPerBar = beats;
            const std::string text = WrittenSongText(written.mSong);
            const CSong again = ReadSong(text, options);
            INFO(text);
            REQUIRE_FALSE(again.HasFault());
            CHECK(ChordsOf(again) == ChordsOf(written.mSong));
            CHECK(again.mChords.back().mPosition == written.mSong.mChords.back().mPosition);
            REQUIRE(again.mSections.size() == written.mSong.mSections.size());
            for (std::size_t ix = 0; ix < again.mSections.size(); ++ix) {
                CHECK(again.mSections[ix].mPosition == written.mSong.mSections[ix].mPosition);
            }
        }
    }
}
