// SPDX-License-Identifier: MIT
#include "brindle/theory/ReadNotesText.h"

#include "brindle/theory/CChordNamePrefs.h"

#include <doctest/doctest.h>

#include <string>
#include <vector>

using namespace brindle;

namespace {

std::string NumbersOf(const std::vector<CNote>& notes) {
    std::string text;
    for (const CNote& note : notes) {
        text += (text.empty() ? "" : " ") + std::to_string(note.mNoteNr);
    }
    return text;
}

// Middle C is C4.
CChordNamePrefs CountingLikeMusicians() {
    CChordNamePrefs prefs = ChordNamePrefsNonUTF8;
    prefs.mOctaveNaming = 1;
    return prefs;
}

}  // namespace

TEST_CASE("Notes are read with the octaves that musicians count, or as numbers") {
    struct CRow {
        const char* mText;
        const char* mNumbers;
    };
    const CRow rows[] = {
        {"C4 Eb4 67", "60 63 67"},
        {"C E G Bb", "60 64 67 70"},
        {"G C E", "67 72 76"},  // each above the one before
        {"G2 F B D", "43 53 59 62"},
        {"B#3 Cb4", "60 59"},  // the octave is that of the letter
        {"C-1 G9", "0 127"},
        {"C4 B#3", "60 60"},
        {" \t", ""},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        const CNotesText read = ReadNotesText(row.mText, CountingLikeMusicians());
        CHECK(read.mError == "");
        CHECK(NumbersOf(read.mTyped) == row.mNumbers);
    }
    CHECK(ReadNotesText("C4 B#3", CountingLikeMusicians()).mNotes.size() == 1);
    CHECK(NumbersOf(ReadNotesText("C3", ChordNamePrefsNonUTF8).mTyped) == "60");
}

TEST_CASE("What is no note is told with its place") {
    struct CRow {
        const char* mText;
        std::size_t mColumn;
        const char* mError;
    };
    const CRow rows[] = {
        {"C4 X4", 3, "a note is a key and its octave, as in Eb4, or a number of 0 to 127"},
        {"60 128", 3, "128 is outside of the notes 0 to 127"},
        {"Cb-1", 0, "Cb-1 is outside of the notes 0 to 127"},
        {"E4m", 0, "behind the key stands its octave, not 4m"},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        const CNotesText read = ReadNotesText(row.mText, CountingLikeMusicians());
        CHECK(read.mError == row.mError);
        CHECK(read.mColumn == row.mColumn);
    }
    std::string many;
    for (std::size_t n = 0; n < kMostTypedNotes; ++n) many += "60 ";
    CHECK(ReadNotesText(many, ChordNamePrefsNonUTF8).mError == "");
    CHECK(ReadNotesText(many + "60", ChordNamePrefsNonUTF8).mError ==
          "a chord has at most 128 notes");
}
