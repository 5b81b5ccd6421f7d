// SPDX-License-Identifier: MIT
#include "brindle/present/ChordGrid.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/guitarchords/GChPitches.h"
#include "brindle/guitarchords/GChTuningDescr.h"
#include "brindle/present/GridsJson.h"
#include "brindle/present/GridsSvg.h"
#include "brindle/present/GridsText.h"
#include "brindle/present/SongGrids.h"
#include "brindle/song/ReadSong.h"

#include <doctest/doctest.h>

#include <string>
#include <vector>

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
        const std::string logged(frets);
        INFO(logged);
        const CFretWindow window = WindowOf(GridOf(frets));
        CHECK(window.mFirst == first);
        CHECK(window.mCount == count);
    }
}

TEST_CASE("Tunings are read as typed, a letter a tritone from the usual string as below it") {
    struct CCase {
        const char* mText;
        const char* mTuning;
    };
    const CCase cases[] = {
        {"EADGBE", "E2 A2 D3 G3 B3 E4"},
        {"DADGAD", "D2 A2 D3 G3 A3 D4"},
        {"BbADGBE", "Bb1 A2 D3 G3 B3 E4"},
        {"EEbDGBE", "E2 D#2 D3 G3 B3 E4"},
        {"E\u266DADGBE", "D#2 A2 D3 G3 B3 E4"},
        {"GDAE", "G2 D3 A3 E4"},
        {"eadgbe", "E2 A2 D3 G3 B3 E4"},
        {"e a d g b e", "E2 A2 D3 G3 B3 E4"},
        {"eb ab db gb bb eb", "D#2 G#2 C#3 F#3 Bb3 D#4"},
        {"e2a2d3gb3b3e4", "E2 A2 D3 F#3 B3 E4"},
        {"bead", "B2 E3 A3 D4"},
        {"dgb", "D2 G2 B2"},
        {"EBbDGBE", "E2 Bb2 D3 G3 B3 E4"},
    };
    for (const auto& [text, tuning] : cases) {
        const std::string logged(text);
        INFO(logged);
        const auto read = ReadTuning(text);
        REQUIRE(read);
        CHECK(TuningText(*read) == tuning);
    }
    CHECK_FALSE(ReadTuning("EA"));
    CHECK_FALSE(ReadTuning("E2 A"));
}

TEST_CASE("Frets are read as people type them") {
    const std::vector<int> c{-1, 3, 2, 0, 1, 0};
    for (const char* text :
         {"x32010", "X32010", "x-3-2-0-1-0", "x,3,2,0,1,0", "x 3 2 0 1 0", " x32010 "}) {
        CHECK(ReadFrets(text) == c);
    }
    for (const char* text : {"", " ", "x  3", "x-3--2", "x3201O", "Am"}) {
        CHECK_FALSE(ReadFrets(text));
    }
}

TEST_CASE("A diagram is drawn from the nut to the last fret of its window") {
    CHECK(GridsText({GridOf("x35553")}, CPaint(false)) ==
          "C\n"
          "x35553\n"
          "C3 G3 C4 E4 G4\n"
          "x\n"
          "-----------\n"
          "| 1-------1 3fr\n"
          "| | | | | |\n"
          "| | 2 3 4 |\n"
          "| | | | | |\n");
    // Five fingers would be needed.
    CHECK(GridsText({GridOf("143212")}, CPaint(false)).find("* | | | * |\n") != std::string::npos);
}

TEST_CASE("A package gives what the options allow, and the finder where it has nothing") {
    GChDatabase database;
    database.readFromDbPackageAtPath(BRINDLE_SOURCE_DIR "/data/" +
                                     std::string(kGChFactoryPackagePath));
    const auto textsOf = [&](const char* symbol, const CFingeringOptions& options) {
        std::string texts;
        for (const CChordGrid& grid : GridsForChord(database, symbol, ReadChordText(symbol).mChord,
                                                    kGChStandardGuitar, options)) {
            texts +=
                (texts.empty() ? "" : " ") + FretsText(grid) + (grid.mLibrary.empty() ? "?" : "");
        }
        return texts;
    };
    CHECK(textsOf("C7", {}) == "x32310 x35353 8-10-8-9-8-8 x-x-10-12-11-12");
    CHECK(textsOf("C7", {.mLimit = 2}) == "x32310 x35353");
    CHECK(textsOf("C7", {.mMayOmitTones = false, .mLimit = 1}) == "x35353");
    CHECK(textsOf("C7", {.mHighestFret = 5}) == "x32310 x35353");
    CHECK(textsOf("C7", {.mCapo = 5}) == "320001 353433 xx5767 x-10-9-10-8-x");
    CHECK(textsOf("F", {.mSpan = 2, .mSpanUpTheNeck = 2, .mLimit = 1}).back() == '?');
    CHECK(textsOf("Cm13", {.mLimit = 1}) == "x33345?");
}

TEST_CASE("Notes are spelled by their chord, and their octave is that of their letter") {
    struct CCase {
        const char* mSymbol;
        std::vector<int> mFrets;
        const char* mNotes;
    };
    for (const auto& [symbol, frets, notes] : std::vector<CCase>{
             {"Cm9", {-1, 3, 1, 3, 3, 3}, "C3 Eb3 Bb3 D4 G4"},
             {"D#m", {-1, -1, 1, 3, 4, 2}, "D#3 A#3 D#4 F#4"},
             {"C#", {-1, 4, 3, 1, 2, 1}, "C#3 E#3 G#3 C#4 E#4"},
             {"C#maj7", {-1, 4, 3, 1, 1, 1}, "C#3 E#3 G#3 B#3 E#4"},
             {"Abm", {4, 6, 6, 4, 4, 4}, "Ab2 Eb3 Ab3 Cb4 Eb4 Ab4"},
             {"D/F#", {2, 0, 0, 2, 3, 2}, "F#2 A2 D3 A3 D4 F#4"},
             {"F#dim7", {-1, -1, 1, 2, 1, 2}, "Eb3 A3 C4 F#4"},
         }) {
        const auto held = FingeringOfFrets(frets, kGChStandardGuitar);
        REQUIRE(held);
        const CChordGrid grid = GridOfFingering(symbol, *held, ReadChordText(symbol).mChord);
        std::string told;
        for (std::size_t i = 0; i < frets.size(); ++i) {
            const std::string note = NoteText(grid, i);
            if (!note.empty()) told += (told.empty() ? "" : " ") + note;
            const std::string dot = DotText(grid, i, TGridDots::Notes);
            CHECK(dot == note.substr(0, note.size() - (note.empty() ? 0 : 1)));
        }
        const std::string logged(symbol);
        INFO(logged);
        CHECK(told == notes);
    }
}

TEST_CASE("Dots and omissions have the degrees of the chord's name") {
    struct CCase {
        const char* mSymbol;
        std::vector<int> mFrets;
        const char* mDegrees;
    };
    for (const auto& [symbol, frets, degrees] : std::vector<CCase>{
             {"C13", {-1, 3, 2, 3, 3, 5}, " 1 3 b7 9 13"},
             {"C6/9", {-1, 3, 2, 2, 3, 3}, " 1 3 6 9 5"},
             {"Cadd9", {-1, 3, 2, 0, 3, 0}, " 1 3 5 9 3"},
             {"Csus2", {-1, 3, 0, 0, 3, 3}, " 1 2 5 2 5"},
             {"Cm11", {-1, 3, 1, 3, 1, 1}, " 1 b3 b7 1 11"},
             {"E7#9", {0, 2, 0, 1, 3, 3}, " 1 5 b7 3 b7 #9"},
             {"Cdim7", {-1, 3, 4, 2, 4, -1}, " 1 b5 bb7 b3"},
             {"D/F#", {2, 0, 0, 2, 3, 2}, " 3 5 1 5 1 3"},
             {"C/D", {-1, -1, 0, 0, 1, 0}, " 2 5 1 3"},
         }) {
        const auto held = FingeringOfFrets(frets, kGChStandardGuitar);
        REQUIRE(held);
        const CChordGrid grid = GridOfFingering(symbol, *held, ReadChordText(symbol).mChord);
        std::string told;
        for (std::size_t i = 0; i < frets.size(); ++i) {
            const std::string dot = DotText(grid, i, TGridDots::Intervals);
            if (!dot.empty()) told += " " + dot;
        }
        const std::string logged(symbol);
        INFO(logged);
        CHECK(told == degrees);
    }
}

TEST_CASE("Notes are written in the style of the grid, and stand apart") {
    CChordNamePrefs german;
    german.mGermanNames = true;
    const std::vector<int> frets{2, 4, 4, 2, 2, 2};
    const auto grid = GridOfFrets("F#m", frets, kGChStandardGuitar, 0, german);
    REQUIRE(grid);
    CHECK(NoteText(*grid, 0) == "Fis2");
    const CGridStyle notes{.mDots = TGridDots::Notes};
    CHECK(GridsText({*grid}, CPaint(false), notes).find("Fis---------A---Cis-Fis\n") !=
          std::string::npos);
    const auto withSigns = GridOfFrets("F#m", frets, kGChStandardGuitar, 0, CChordNamePrefs());
    REQUIRE(withSigns);
    CHECK(
        GridsText({*withSigns}, CPaint(false), notes).find("F\u266F-------A--C\u266F-F\u266F\n") !=
        std::string::npos);
}

TEST_CASE("Degrees of three letters have room") {
    const std::vector<int> frets{-1, 3, 4, 2, 0, 0};
    const auto held = FingeringOfFrets(frets, kGChStandardGuitar);
    REQUIRE(held);
    const CGridStyle style{.mDots = TGridDots::Intervals};
    const std::vector grids{GridOfFingering("Cmaj13#11", *held, ReadChordText("Cmaj13#11").mChord)};
    const std::string text = GridsText(grids, CPaint(false), style);
    CHECK(text.find("|   |   #11 |") != std::string::npos);
    const std::string svg = GridsSvg(grids, "C", style);
    CHECK(svg.find("font-size=\"6.4\" ") != std::string::npos);
    CHECK(svg.find("font-size=\"8\" ") != std::string::npos);
}

TEST_CASE("A song tells above its diagrams where the capo lies, and what its shapes sound") {
    const CSong song = ReadSong("Bb F | Gm Eb");
    const auto shown = MakeSongGrids(song, kGChStandardGuitar, {}, TSongCapo::Easiest);
    const std::string text = SongGridsText(shown, CPaint(false), {});
    CHECK(text.find("capo 3: G D Em C (difficulty 1.8)\n") == 0);
    CHECK(text.find("\nsounds Bb ") != std::string::npos);
    const std::string svg = SongGridsSvg(shown, "Song");
    CHECK(svg.find(">capo 3: G D Em C (difficulty 1.8)<") != std::string::npos);
    CHECK(svg.find(">022000, capo 3, sounds Gm<") != std::string::npos);
    // Lines are broken where the sheet ends.
    std::string many;
    for (const char* root : {"C", "D", "Eb", "E", "F", "F#", "G", "Ab", "A", "Bb", "B"}) {
        for (const char* kind : {" ", "m7 ", "maj7 ", "7 "}) many += std::string(root) + kind;
    }
    const auto all = MakeSongGrids(ReadSong(many), kGChStandardGuitar, {}, TSongCapo::Told);
    const std::string sheet = SongGridsSvg(all, "Song");
    const std::size_t first = sheet.find(">no capo: C Cm7 ");
    REQUIRE(first != std::string::npos);
    CHECK(sheet.find("Bmaj7 B7 (difficulty") > sheet.find("<text", first));
    const auto plain = MakeSongGrids(song, kGChStandardGuitar, {}, TSongCapo::Told);
    CHECK(SongGridsText(plain, CPaint(false), {}).find("sounds") == std::string::npos);
}

TEST_CASE("A chord has a diagram for each of its fingerings, and shares none with another chord") {
    const std::vector<std::string> symbols{"C", "C", "Cmaj", "C"};
    const CChordLite c = ReadChordText("C").mChord;
    CSongFingerings played;
    for (const std::vector<int>& frets : {std::vector{-1, 3, 2, 0, 1, 0},
                                          {-1, 3, 5, 5, 5, 3},
                                          {-1, 3, 2, 0, 1, 0},
                                          {-1, 3, 2, 0, 1, 0}}) {
        played.mFingerings.push_back(FingeringForChord(frets, c, kGChStandardGuitar).value());
    }
    const auto shown = MakeSongGrids(std::vector(4, c), symbols, std::vector{played});
    CHECK(shown.mGridOfChord == std::vector<std::optional<std::size_t>>{0, 1, 2, 0});
    CHECK(FretsText(GridsBySymbol(shown).at("C")) == "x32010");
}

TEST_CASE("For the left hand the lowest string stands on the right") {
    CGridStyle left;
    left.mLeftHanded = true;
    const std::string text = GridsText({GridOf("x32010")}, CPaint(false), left);
    CHECK(text.find("o   o     x") != std::string::npos);
    CHECK(GridsJson({GridOf("x32010")}, left).find("\"LeftHanded\": true") != std::string::npos);
    CHECK(GridsJson({GridOf("x32010")}).find("\"LeftHanded\": false") != std::string::npos);
    CHECK(GridsSvg({GridOf("x32010")}, "C", left) != GridsSvg({GridOf("x32010")}, "C"));
}

}  // namespace
}  // namespace brindle::test
