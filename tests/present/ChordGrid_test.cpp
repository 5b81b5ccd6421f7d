// SPDX-License-Identifier: MIT
#include "brindle/present/ChordGrid.h"

#include "brindle/guitarchords/GChPitches.h"
#include "brindle/guitarchords/GChTuningDescr.h"
#include "brindle/present/GridsText.h"

#include <doctest/doctest.h>

#include <string>

namespace brindle::test {
namespace {

CChordGrid GridOf(const std::string& frets) {
    const auto read = ReadFrets(frets);
    REQUIRE(read);
    const auto grid = GridOfFrets(frets, *read, kGChStandardGuitar, 0);
    REQUIRE(grid);
    return *grid;
}

TEST_CASE("A grid shows four frets from the nut, or from its lowest fret where it lies higher") {
    struct CCase {
        const char* mFrets;
        int mFirst;
        int mCount;
    };
    const CCase cases[] = {
        {"x32010", 0, 4},  // C
        {"022444", 0, 4},  // reaches the fourth fret
        {"x35553", 2, 4},  // beyond it: from its lowest
        {"000000", 0, 4},  // nothing is fretted
        {"100005", 0, 5},  // five frets apart
        {"x-10-12-12-11-10", 9, 4},
    };
    for (const auto& [frets, first, count] : cases) {
        INFO(frets);
        const CFretWindow window = WindowOf(GridOf(frets));
        CHECK(window.mFirst == first);
        CHECK(window.mCount == count);
    }
}

TEST_CASE("A letter a tritone away from the usual string is tuned down to") {
    struct CCase {
        const char* mText;
        const char* mTuning;
    };
    const CCase cases[] = {
        {"EADGBE", "E2 A2 D3 G3 B3 E4"},        {"DADGAD", "D2 A2 D3 G3 A3 D4"},
        {"BbADGBE", "Bb1 A2 D3 G3 B3 E4"},      {"EEbDGBE", "E2 D#2 D3 G3 B3 E4"},
        {"E\u266DADGBE", "D#2 A2 D3 G3 B3 E4"}, {"GDAE", "G2 D3 A3 E4"},
    };
    for (const auto& [text, tuning] : cases) {
        INFO(text);
        const auto read = ReadTuning(text);
        REQUIRE(read);
        CHECK(TuningText(*read) == tuning);
    }
    CHECK_FALSE(ReadTuning("EA"));
    CHECK_FALSE(ReadTuning("E2 A"));
}

TEST_CASE("A diagram is drawn from the nut to the last fret of its window") {
    CHECK(GridsText({GridOf("x35553")}, CPaint(false)) ==
          "C\n"
          "x35553\n"
          "C3 G3 C4 E4 G4\n"
          "x\n"
          "-----------\n"
          "| * | | | * 3fr\n"
          "| | | | | |\n"
          "| | * * * |\n"
          "| | | | | |\n");
}

}  // namespace
}  // namespace brindle::test
