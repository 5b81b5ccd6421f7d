// SPDX-License-Identifier: MIT
#include "brindle/present/MidiFile.h"

#include "brindle/platform/AtomicFile.h"
#include "tests/support/Transcript.h"

#include <doctest/doctest.h>

#include <filesystem>
#include <string_view>

namespace brindle::test {
namespace {

template <std::size_t size>
std::string Bytes(const char (&text)[size]) {
    return std::string(text, size - 1);
}

TEST_CASE("A note that is struck again, however softly, ends before it begins, byte by byte") {
    CMidiPiece piece;
    piece.mTicksPerQuarter = 96;
    piece.mTracks = {{"", {}, {{200, 100, 9, 60, 0}, {0, 200, 9, 60, 100}}}};
    CHECK(MidiFileBytes(piece) == Bytes("MThd\0\0\0\6\0\1\0\2\0\x60"
                                        "MTrk\0\0\0\4\0\xFF\x2F\0"
                                        "MTrk\0\0\0\x15\0\x99\x3C\x64\x81\x48\x89\x3C\x40"
                                        "\0\x99\x3C\1\x64\x89\x3C\x40"
                                        "\0\xFF\x2F\0"));
}

// Two tracks in a mess, with values that no file can hold.
CMidiPiece UntidyPiece() {
    CMidiPiece piece;
    piece.mTempos = {{960, 90.0}, {0, 120.0}, {1920, 0.0}, {1921, -1.0}, {1922, 0.5}};
    piece.mTimeSignatures = {{0, 3, 4}, {1440, 6, 8}, {2000, 300, 7}};
    piece.mKeySignatures = {{0, -3, true}, {10, 9, false}};
    piece.mTracks = {
        {"Chords",
         {{480, 0, 24}, {0, 0, 0}},
         // The same note twice without a break, and notes at impossible places.
         {{480, 480, 0, 60, 0},
          {0, 480, 0, 60, 90},
          {-5, 0, 99, 64, 200},
          {0, 10, 0, 128, 64},
          {INT64_MAX, INT64_MAX, 1, 67, 64}}},
        {"Bass", {}, {}},
    };
    return piece;
}

constexpr std::string_view kAsTable =
    "0, 0, Header, 1, 3, 480\n"
    "1, 0, Start_track\n"
    "1, 0, Time_signature, 3, 2, 24, 8\n"
    "1, 0, Key_signature, -3, \"minor\"\n"
    "1, 0, Tempo, 500000\n"
    "1, 10, Key_signature, 7, \"major\"\n"
    "1, 960, Tempo, 666667\n"
    "1, 1440, Time_signature, 6, 3, 24, 8\n"
    "1, 1920, Tempo, 16777215\n"
    "1, 1921, Tempo, 500000\n"
    "1, 1922, Tempo, 16777215\n"
    "1, 2000, Time_signature, 255, 2, 24, 8\n"
    "1, 2000, End_track\n"
    "2, 0, Start_track\n"
    "2, 0, Title_t, \"Chords\"\n"
    "2, 0, Program_c, 0, 0\n"
    "2, 0, Note_on_c, 0, 60, 90\n"
    "2, 0, Note_on_c, 15, 64, 127\n"
    "2, 1, Note_off_c, 15, 64, 64\n"
    "2, 480, Note_off_c, 0, 60, 64\n"
    "2, 480, Program_c, 0, 24\n"
    "2, 480, Note_on_c, 0, 60, 1\n"
    "2, 960, Note_off_c, 0, 60, 64\n"
    "2, 268435454, Note_on_c, 1, 67, 64\n"
    "2, 268435455, Note_off_c, 1, 67, 64\n"
    "2, 268435455, End_track\n"
    "3, 0, Start_track\n"
    "3, 0, Title_t, \"Bass\"\n"
    "3, 0, End_track\n"
    "0, 0, End_of_file\n";

TEST_CASE("Another program reads from a MIDI file what was put into it") {
    if (RunCommand("command -v midicsv >/dev/null").mShown != "") {
        MESSAGE("skipped: midicsv is not installed");
        return;
    }
    const auto path = std::filesystem::temp_directory_path() / "brindle_midi_file_test.mid";
    REQUIRE(WriteFileAtomically(path, MidiFileBytes(UntidyPiece())));
    CHECK(RunCommand("midicsv " + path.string()).mShown == kAsTable);
    std::filesystem::remove(path);
}

}  // namespace
}  // namespace brindle::test
