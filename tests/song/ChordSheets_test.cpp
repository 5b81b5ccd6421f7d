// SPDX-License-Identifier: MIT
#include "brindle/song/ReadSong.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <chrono>
#include <limits>
#include <string>

using namespace brindle;

namespace {

/// "C@0 F@4 end@8", by what was typed.
std::string Shown(const CSong& reading) {
    std::string text;
    for (std::size_t i = 0; i < reading.mChords.size(); ++i) {
        const bool isEnd = i == reading.mSymbols.size();
        text += fmt::format("{}{}@{:.4g}", i > 0 ? " " : "", isEnd ? "end" : reading.mSymbols[i],
                            reading.mChords[i].mPosition);
    }
    return text;
}

std::string Shown(std::string_view text, const CSongOptions& prefs = {}) {
    const CSong reading = ReadSong(text, prefs);
    for (const CSongFault& fault : reading.mFaults) {
        return fmt::format("{}:{}: {}", fault.mLine, fault.mColumn, fault.mText);
    }
    return Shown(reading);
}

std::string Sections(std::string_view text, const CSongOptions& prefs = {}) {
    std::string shown;
    for (const CSongSection& section : ReadSong(text, prefs).mSections) {
        shown +=
            fmt::format("{}{}@{}", shown.empty() ? "" : ", ", section.mName, section.mPosition);
    }
    return shown;
}

}  // namespace

TEST_CASE("A song is put in time by its bar lines, holds and repeats") {
    struct CRow {
        const char* mText;
        const char* mShown;
    };
    const CRow rows[] = {
        {"", ""},
        {"| . |", ""},
        {"C F | G7 . . . | C", "C@0 F@1 G7@4 C@8 end@12"},
        {"|C F||G7|C|", "C@0 F@1 G7@4 C@8 end@12"},
        {"C / F / | G ///", "C@0 F@2 G@4 end@8"},
        {"Am - F – C → G", "Am@0 F@1 C@2 G@3 end@4"},
        {"C-G-Am-F | C-7 F-7", "C@0 G@1 Am@2 F@3 C-7@4 F-7@5 end@8"},
        {"Dm7–G7→C^, | Am->F,C", "Dm7@0 G7@1 C^@2 Am@4 F@5 C@6 end@8"},
        {"C | C-x-F", "1:7: C-x-F: \"x\" at 3 is not understood"},
        {"C-G-", "1:3: C-G-: \"G\" at 3 is not understood"},
        {"C--G -F", "1:6: -F: a chord begins with a note A to H, \"-\" at 1 is none"},
        {"C-G | Dm–Amx-F", "1:12: Amx: \"x\" at 3 is not understood"},
        {"C-7-F7⇒Bb^ | Cm7-5‑F7", "C-7@0 F7@1 Bb^@2 Cm7-5@4 F7@5 end@8"},
        {"Dm7, G7;\nC", "Dm7@0 G7@1 C@2 end@3"},
        // A bar ends with its line, unless the next line holds its last chord.
        {"C | F\nAm | G", "C@0 F@4 Am@8 G@12 end@16"},
        {"C | F |\n[B]\n| Am | G\nC", "C@0 F@4 Am@8 G@12 C@16 end@20"},
        {"C | F\n. . | G", "C@0 F@4 G@8 end@12"},
        {"C | F x2\nHere is a line\nG | C", "C@0 F@4 C@8 F@12 G@16 C@20 end@24"},
        {"C | F x2\nG | C", "C@0 F@4 C@8 F@12 G@16 C@20 end@24"},
        {"C F [2x]\nG", "C@0 F@1 C@2 F@3 G@4 end@5"},
        {"C F\nG Am | F", "C@0 F@1 G@2 Am@3 F@4 end@8"},
        {"C | % | F G | % %", "C@0 C@4 F@8 G@9 end@16"},
        {"C G | F | .//. | Am", "C@0 G@1 F@4 C@8 G@9 F@12 Am@16 end@20"},
        {"C | % | % |", "C@0 C@4 C@8 end@12"},
        {"|: C | F :| G", "C@0 F@4 C@8 F@12 G@16 end@20"},
        {"Am | C |: F :| G :|", "Am@0 C@4 F@8 F@12 G@16 G@20 end@24"},
        {"|: C [1 F :| [2 G | Am", "C@0 F@4 C@8 G@12 Am@16 end@20"},
        {"|: C | [1,2 F :| [3 G :|: Am :|", "C@0 F@4 C@8 F@12 C@16 G@20 Am@24 Am@28 end@32"},
        {"|:C[1. F|Am:|[2 G|Bb:|[3 Eb|", "C@0 F@4 Am@8 C@12 G@16 Bb@20 C@24 Eb@28 end@32"},
        {"|: C [1 F :| G", "C@0 F@4 C@8 G@12 end@16"},
        {"C maj7 | E flat m7 | C7 (b9) b13 | (E7)",
         "C maj7@0 E flat m7@4 C7 (b9) b13@8 (E7)@12 end@16"},
        {"C, m7x | F", "1:4: m7x: a chord begins with a note A to H, \"m7x\" at 1 is none"},
        {"N.C. | C X", "N.C.@0 C@4 X@5 end@8"},
        {"{Verse} C | {Chorus 2} F", "C@0 F@4 end@8"},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        CHECK(Shown(row.mText) == row.mShown);
    }
    CHECK(Shown("C F | G", {.mBeatsPerBar = 3, .mBeatsPerChord = 1.5}) == "C@0 F@1.5 G@3 end@6");
}

TEST_CASE("The chords of a bar share it evenly when asked") {
    const CSongOptions even{.mEven = true};
    CHECK(Shown("C F G | Am . F | C", even) == "C@0 F@1.333 G@2.667 Am@4 F@6 C@8 end@12");
    CHECK(Shown("C F G", even) == "C@0 F@1 G@2 end@3");
}

TEST_CASE("Parts of a song have names") {
    CHECK(Sections("{Verse} C | F {Chorus 2} G") == "Verse@0, Chorus 2@5");
    CHECK(Sections("Intro: C |\nVerse 2: F |\nA section: G | C Outro: F") ==
          "Intro@0, Verse 2@4, A section@8, Outro@13");
    CHECK(Sections("|: {A} C :|") == "A@0, A@4");
    CHECK(Sections("{A} C | % | F") == "A@0");
    CHECK(Sections("[A]\nC | F\n[B]\nDm | G") == "A@0, B@8");
    CHECK(Sections("[A] C7 | F7\n[B] (x2)\nDm | G") == "A@0, B@8");
    CHECK(Sections("Verse: C F x2\nChorus: G") == "Verse@0, Chorus@4");
    CHECK(Sections("[Intro] G C\n[Verse 1] Am F") == "Intro@0, Verse 1@2");
    CHECK(Shown("A: C:maj7 | G:min") == "C:maj7@0 G:min@4 end@8");
}

TEST_CASE("A song with any H is German as a whole") {
    const auto keys = [](std::string_view text) {
        std::string shown;
        for (const CHarmAnlsChordWithPos& chord : ReadSong(text).mChords) {
            shown += fmt::format("{} ", chord.mRootKeyEnh.mKeyNr);
        }
        return shown;
    };
    CHECK(keys("B F C B7/A") == "11 5 0 11 15 ");
    CHECK(keys("B F C Bb H7") == "10 5 0 10 11 15 ");
    CHECK(keys("B E/H") == "10 4 15 ");
}

TEST_CASE("The first fault of a song is told with its line and column") {
    struct CRow {
        const char* mText;
        const char* mShown;
    };
    const CRow rows[] = {
        {"C F\n| G♭7 Cm7x9 | Hello", R"(2:10: Cm7x9: "x" at 4 is not understood)"},
        {"C | {Verse", R"(1:5: "{" has no "}" behind it)"},
        {"% | C", "1:1: there is no bar before this one to repeat"},
        {"C | .//. | F", "1:5: there are no two bars before to repeat"},
        {"C [64 F", "1:3: an ending has a number from 1 to 63"},
        {"|: C :| Zzz", R"(1:9: Zzz: a chord begins with a note A to H, "Zzz" at 1 is none)"},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        CHECK(Shown(row.mText) == row.mShown);
        CHECK(ReadSong(row.mText).mChords.empty());
    }
    const CSong lenient = ReadSong("C Cm7x9 | {A | F\n Zzz | G", {.mLenient = true});
    CHECK(Shown(lenient) == "C@0 Cm7x9@1 Zzz@4 G@8 end@12");
    CHECK(lenient.mChords[1].IsNoChordYield());
    CHECK(lenient.mFaults.size() == 3);
    CHECK(lenient.mFaults[2].mLine == 2);
    CHECK(Shown("C", {.mBeatsPerBar = std::numeric_limits<double>::quiet_NaN()}) ==
          "1:1: bars and chords have a length above 0");
}

TEST_CASE("Names of parts and lines of chords stand between lyrics with chords in brackets") {
    const char* song =
        "{Title : Grace}\n[Verse 1: Me]\n[C]Hello [G]there\n[Chorus] [F]la\nC-G Am D\nGo Do\nA\n";
    CHECK(ReadSong(song).mTitle == "Grace");
    CHECK(Shown(song) == "C@0 G@1 F@2 C@3 G@4 Am@5 D@6 end@7");
    CHECK(Sections(song) == "Verse 1: Me@0, Chorus@2");
}

TEST_CASE("Words between hyphens are chords where chords stand") {
    CHECK(Shown("Verse\nC - G\nGo - go - go\nDo-Do-Do\nAm–F, C\nHal-le-lu-jah - ah\n") ==
          "C@0 G@1 Am@2 F@3 C@4 end@5");
}

TEST_CASE("How chords are played is no song") {
    CHECK(Shown("[Chords]\nC x32010\nG = 320003\nBb7: x13131\n\nVerse\nC G\nLa la\n") ==
          "C@0 G@1 end@2");
}

TEST_CASE("A song with directives may have its chords on lines of their own") {
    const char* song =
        "{title: Down the Line}\n{time: 3/4}\n# G\n{soc}\nG      D7/F#\nHello my dear\n"
        "{eoc}\n[Verse 1] Em-C\nA line, a line\n{sot}\nE|--3--|\nG\n{eot}\nD | G |\n{chorus}\n";
    const CSong reading = ReadSong(song);
    CHECK(reading.mTitle == "Down the Line");
    CHECK(Shown(song) == "G@0 D7/F#@1 Em@2 C@3 D@4 G@6 G@9 D7/F#@10 end@12");
    CHECK(Sections(song) == "Chorus@0, Verse 1@2, Chorus@9");
    CHECK(Shown("{title: x}\nC\nOh my\n{sog}\n| F . | G |\n{eog}") == "C@0 F@4 G@8 end@12");
}

TEST_CASE("Lyrics with chords in brackets are read") {
    const char* song =
        "# a remark\n{title: Amazing Grace}\n{key: G}\n{time: 3/4}\n{c: Verse}\n"
        "A[G]mazing [G7/B]grace, how [C]sweet [*softly] the [G]sound\n"
        "{sot}\ne|---3---|\n{eot}\n{soc}\n| [Em] . . | [C][D7] . |\n";
    const CSong reading = ReadSong(song, {.mFormat = TSongFormat_Auto});
    CHECK(reading.mFaults.empty());
    CHECK(reading.mTitle == "Amazing Grace");
    CHECK(reading.mStatedKey == CSignKeyLite("G major"));
    CHECK(reading.mBeatsPerBar == 3.0);
    CHECK(Shown(reading) == "G@0 G7/B@1 C@2 G@3 Em@6 C@9 D7@10 end@12");
    CHECK(Sections(song, {.mFormat = TSongFormat_ChordPro}) == "Verse@0, Chorus@4");
    CHECK(Shown("Oh [C]my [Gx7", {.mFormat = TSongFormat_ChordPro}) ==
          R"(1:10: "[" has no "]" behind it)");
}

TEST_CASE("Packed charts are read") {
    const CSongOptions chart{.mFormat = TSongFormat_Chart};
    CHECK(Shown("[T44C^7 |A-7 D7 |G7sus,p,B7alt,p|Eh7/Bb W/A Z", chart) ==
          "C^7@0 A-7@4 D7@6 G7sus@8 B7alt@10 Eh7/Bb@12 W/A@14 end@16");
    const std::string song =
        "Song=Writer Some=Swing=Eb=n={*AT34F-7 |x |N1Bb7(E7)|C7}|N2Bb7 |Eb6<Fine>} [*BAb^7 |r|G Z";
    CHECK(Shown(song, chart) ==
          "F-7@0 F-7@3 Bb7@6 C7@9 F-7@12 F-7@15 Bb7@18 Eb6@21 Ab^7@24 "
          "Eb6@27 Ab^7@30 G@33 end@36");
    const CSong reading = ReadSong(song, {.mFormat = TSongFormat_Auto});
    CHECK(reading.mTitle == "Song");
    CHECK(reading.mStatedKey == CSignKeyLite("Eb major"));
    const CChordLite sameWithBass = ReadSong("C^7W/G", chart).mChords[1];
    CHECK(sameWithBass == CChordLite(CKeyEnh_C, CKeyEnh_G, CSemitones{0, 4, 7, 11}));
    CHECK_FALSE(ReadSong("C^7/EW/C", chart).mChords[1].HasBassNote());
    const CSongOptions german{.mFormat = TSongFormat_Chart, .mChordTextPrefs{.mBIsBFlat = true}};
    CHECK(ReadSong("C^7W/B", german).mChords[1].mBassKeyEnh == CKeyEnh{10, TEnh_b});
    CHECK(Shown("C^7 |?", chart) == R"(1:6: "?" is not understood)");
}

TEST_CASE("Hostile songs end in time and in bounds") {
    const auto repeated = [](const char* piece, std::size_t length) {
        std::string text;
        while (text.size() < length) text += piece;
        return text;
    };
    const auto seconds = [&](const char* piece, std::size_t length, TSongFormat form) {
        const std::string text = repeated(piece, length);
        const auto start = std::chrono::steady_clock::now();
        const CSong reading = ReadSong(text, {.mFormat = form, .mLenient = true});
        CHECK(reading.mChords.size() < 2'000'000);
        return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    };
    const char* const pieces[] = {
        "C ", "C :| ", "[1 C :| ", "{",      "% | ", "C: ", "[C]a", "[",     "W/C",
        "<",  "Zz ",   "C7 b9 ",   "|:[63 ", "r|",   "C[ ", "*A",   "(b9) ", "(x,F);"};
    constexpr std::size_t kLength = 1 << 11;
    for (const char* piece : pieces) {
        for (const auto form : {TSongFormat_ChordText, TSongFormat_ChordPro, TSongFormat_Chart,
                                TSongFormat_ChordStrings}) {
            CAPTURE(piece);
            CAPTURE(form);
            CHECK(seconds(piece, 16 * kLength, form) < 1.0 + 64 * seconds(piece, kLength, form));
        }
    }
    const std::string many = "|: " + repeated("C F G Am | ", 600'000) + "[1-62 C :| [63 D";
    CHECK(Shown(many) == "1:1: its repeats and jumps make the song too long to be played");
}
