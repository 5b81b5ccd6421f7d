// SPDX-License-Identifier: MIT
#include "brindle/analysis/ReadRomanText.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <string>

namespace brindle::test {
namespace {

std::string NameOf(const CSignKeyLite& key) {
    return key.NameShort(ChordNamePrefsNonUTF8);
}

// "0+2 C I; 2+2 C V65/V"
std::string ChordsText(const CRomanTextReading& reading) {
    std::string text;
    for (const CRomanTextChord& chord : reading.mChords) {
        text += fmt::format("{}{:.4g}+{:.4g} {} {}", text.empty() ? "" : "; ", chord.mPosition,
                            chord.mLength, NameOf(chord.mKey), chord.mNumeral);
        if (!chord.mNumeralBefore.empty()) {
            text += fmt::format(" = {} {}", NameOf(chord.mKeyBefore), chord.mNumeralBefore);
        }
    }
    return text;
}

std::string FaultsText(const std::vector<CTextFault>& faults) {
    std::string text;
    for (const CTextFault& fault : faults) {
        text += fmt::format("{}{}:{} {}", text.empty() ? "" : "; ", fault.mLine, fault.mColumn,
                            fault.mText);
    }
    return text;
}

std::string BarsText(const CRomanTextReading& reading) {
    std::string text;
    for (const CRomanTextBar& bar : reading.mBars) {
        text += fmt::format("{}{}@{:.4g}+{:.4g}", text.empty() ? "" : " ", bar.mNumber,
                            bar.mPosition, bar.mLength);
    }
    return text;
}

TEST_CASE("A whole analysis is read with its keys, bars and times") {
    const CRomanTextReading reading = ReadRomanText(
        "Composer: A. Nonymous\n"
        "Title: Little piece\n"
        "Analyst: A Student\n"
        "Movement: 2\n"
        "Time Signature: 4/4\n"
        "Form: binary\n"
        "\n"
        "m0 b4 C: I\n"
        "m1 I b3 V65/V\r\n"
        "m2 V b2.5 V42 b4 I6 ||\n"
        "Note: here it turns\n"
        "m3 vi a: i b3 V7\n"
        "m4 i NC b3 i\n"
        "Time Signature: 3/4\n"
        "m6 Bb: I b2.33 V b2.66 I\n");
    CHECK(reading.mTitle == "Little piece");
    CHECK(reading.mComposer == "A. Nonymous");
    CHECK(reading.mAnalyst == "A Student");
    CHECK(reading.mMovement == "2");
    CHECK(BarsText(reading) == "0@0+1 1@1+4 2@5+4 3@9+4 4@13+4 5@17+3 6@20+3");
    CHECK(ChordsText(reading) ==
          "0+1 C I; 1+2 C I; 3+2 C V65/V; 5+1.5 C V; 6.5+1.5 C V42; 8+1 C I6; "
          "9+2 Am i = C vi; 11+2 Am V7; 13+2 Am i; 15+5 Am i; "
          "20+1.333 Bb I; 21.33+0.3333 Bb V; 21.67+1.333 Bb I");
    REQUIRE(reading.mKeys.size() == 3);
    CHECK(NameOf(reading.mKeys[1].mKey) == "Am");
    CHECK(reading.mKeys[1].mPosition == 9.0);
    REQUIRE(reading.mTimes.size() == 2);
    CHECK(reading.mTimes[1].mBeats == 3);
    CHECK(reading.mTimes[1].mPosition == 17.0);
    REQUIRE(reading.mDoubleBars.size() == 1);
    CHECK(reading.mChords[2].mChord == CChordLite("D7/F#", ChordNamePrefsNonUTF8));
    // One beat cannot hold two chords.
    CHECK(FaultsText(reading.mFaults) == "13:6 there is a chord on this beat already");
    CHECK(reading.mNotes.empty());
}

TEST_CASE("Measures are copied in the key of their new place, and in their own keys") {
    const CRomanTextReading reading = ReadRomanText(
        "m1 C: I b3 V\nm2 vi\nm3-4 = m1-2\nm5 G: I b3 V7\nm6 = m2\nm7 = m1\nm8 = m6\n");
    CHECK(FaultsText(reading.mFaults).empty());
    CHECK(ChordsText(reading) ==
          "0+2 C I; 2+2 C V; 4+4 C vi; 8+2 C I; 10+2 C V; 12+4 C vi; 16+2 G I; 18+2 G V7; "
          "20+4 G vi; 24+2 C I; 26+2 C V; 28+4 C vi");
}

TEST_CASE("A typed line needs no measure") {
    const struct {
        const char* mText;
        const char* mChords;
        const char* mBars;
    } rows[] = {
        {"C: I V a: i", "0+1 C I; 1+1 C V; 2+2 Am i", "1@0+4"},
        {"C: I IV V I vi", "0+1 C I; 1+1 C IV; 2+1 C V; 3+1 C I; 4+4 C vi", "1@0+4 2@4+4"},
        {"C: I V | a: i . V || i", "0+1 C I; 1+3 C V; 4+2 Am i; 6+2 Am V; 8+4 Am i",
         "1@0+4 2@4+4 3@8+4"},
        {"Time Signature: 6/8\nC: I V7 I", "0+1.5 C I; 1.5+1.5 C V7; 3+3 C I", "1@0+3 2@3+3"},
        {"C: I b3 V65/V", "0+2 C I; 2+2 C V65/V", "1@0+4"},
        {"C: I\nV\nm4 I", "0+4 C I; 4+8 C V; 12+4 C I", "1@0+4 2@4+4 3@8+4 4@12+4"},
        {"C: I NC\n\nb3 a: V", "0+1 C I; 1+5 C NC; 6+2 Am V", "1@0+4 2@4+4"},
        {"m1 C: I b3 V65/V | a: i |", "0+2 C I; 2+2 C V65/V; 4+4 Am i", "1@0+4 2@4+4"},
        {"C: I b3 IV | vi b3 IV", "0+2 C I; 2+2 C IV; 4+2 C vi; 6+2 C IV", "1@0+4 2@4+4"},
    };
    for (const auto& row : rows) {
        INFO(std::string(row.mText));
        const CRomanTextReading reading = ReadRomanText(row.mText);
        CHECK(FaultsText(reading.mFaults).empty());
        CHECK(ChordsText(reading) == row.mChords);
        CHECK(BarsText(reading) == row.mBars);
    }
    const CRomanTextReading doubleBar = ReadRomanText("C: I | V || I");
    CHECK(doubleBar.mDoubleBars == std::vector<double>{8.0});
    CHECK(FaultsText(ReadRomanText("C: I X77 V").mFaults) == "1:6 this is no degree");
    CHECK(ChordsText(ReadRomanText("C major: I V")) == "0+1 C I; 1+3 C V");
    CHECK(ChordsText(ReadRomanText("E flat: I V\nf sharp: i V")) ==
          "0+1 Eb I; 1+3 Eb V; 4+1 F#m i; 5+3 F#m V");
    CHECK(FaultsText(ReadRomanText("E flat: I\nf sharp minor: i X").mFaults) ==
          "2:18 this is no degree");
    CHECK(ChordsText(ReadRomanText("m1 E flat: I b3 a minor: V | f sharp: i b3 Am: i")) ==
          "0+2 Eb I; 2+2 Am V; 4+2 F#m i; 6+2 Am i");
    CHECK(ChordsText(ReadRomanText("C: I | e flat major: I b: i")) ==
          "0+4 C I; 4+1 Eb I; 5+3 Bm i");
    CHECK(ReadRomanText("Form: binary\nNote: I think so\nPiece: V\n").mFaults.empty());
}

TEST_CASE("A key from outside holds up to the first one of the text") {
    const CSignKeyLite gMajor({7, TEnh_n}, TSignKeyType_Major);
    const CRomanTextReading reading = ReadRomanText("m1 I b3 V65/V\nm2 D: I\n", gMajor);
    CHECK(FaultsText(reading.mFaults).empty());
    CHECK(ChordsText(reading) == "0+2 G I; 2+2 G V65/V; 4+4 D I");
    CHECK(reading.mChords[1].mChord == CChordLite("A7/C#", ChordNamePrefsNonUTF8));
    CHECK(reading.mKeys.size() == 2);
    CHECK(ReadRomanText("I V", gMajor).mChords.size() == 2);
    CHECK(FaultsText(ReadRomanText("m1 I").mFaults) ==
          "1:4 a numeral needs a key before it, as in C: I");
}

struct CBeatCase {
    const char* mTime;
    const char* mBeats;
    const char* mChords;
};

TEST_CASE("Beats are those of the time signature") {
    for (const CBeatCase& row : {
             CBeatCase{"6/8", "I b1.33 V b2 I", "0+0.5 C I; 0.5+1 C V; 1.5+1.5 C I"},
             CBeatCase{"slow 6/8", "I b2 V b6 I", "0+0.5 C I; 0.5+2 C V; 2.5+0.5 C I"},
             CBeatCase{"3/8", "I b1.67 V", "0+1 C I; 1+0.5 C V"},
             CBeatCase{"Cut", "I b2 V", "0+2 C I; 2+2 C V"},
             CBeatCase{"9/8", "I b2 V b3.66 I", "0+1.5 C I; 1.5+2.5 C V; 4+0.5 C I"},
             CBeatCase{"3/2", "I b3 V", "0+4 C I; 4+2 C V"},
             CBeatCase{"C", "I b1.25 V b4.75 I", "0+0.25 C I; 0.25+3.5 C V; 3.75+0.25 C I"},
             CBeatCase{"2/4", "I b1.66.5 V b2.5.5 I",
                       "0+0.8333 C I; 0.8333+0.9167 C V; 1.75+0.25 C I"},
             CBeatCase{"5/8", "I b4 V", "0+1.5 C I; 1.5+1 C V"},
         }) {
        INFO(std::string(row.mTime));
        const CRomanTextReading reading =
            ReadRomanText(std::string("Time Signature: ") + row.mTime + "\nm1 C: " + row.mBeats);
        CHECK(FaultsText(reading.mFaults).empty());
        CHECK(ChordsText(reading) == row.mChords);
    }
}

TEST_CASE("What is wrong is told with its line and column, and the rest is read") {
    const CRomanTextReading reading = ReadRomanText(
        "m1 I C: I b2 \xC3\xA9X7 b1.5 IV b9 V b3 V7\xC3\xB8\n"
        "m1 I\n"
        "m2var1 V\n"
        "m2-3 I\n"
        "m4-6 = m1-2\n"
        "m4-5 = m1-2\n"
        "m4 = x\n"
        "m1 = m1\n"
        "Time Signature: 5/6\n"
        "Pedal: G m1 b1 m2 b1\n"
        "nonsense\n");
    CHECK(FaultsText(reading.mFaults) ==
          "1:4 a numeral needs a key before it, as in C: I; "
          "1:14 this is no degree; "
          "1:18 the beat is before the one that was told; "
          "1:23 there is a chord on this beat already; "
          "1:26 the bar has no such beat; "
          "1:29 there is a chord on this beat already; "
          "1:35 this sign behind the degree is not understood; "
          "2:1 the number of the measure is not higher than the one before; "
          "4:1 more than one measure is a copy, with =; "
          "5:8 the copy is not as long as what is copied; "
          "6:8 a measure that is copied is not there; "
          "7:6 measures are expected behind =; "
          "8:1 the number of the measure is not higher than the one before; "
          "9:17 this is no time signature; "
          "11:1 this is neither a measure nor a header");
    CHECK(!ReadRomanText("m1 C: I b1.5.5.5 V").mFaults.empty());
    CHECK(!ReadRomanText("m1 C: I b1.2.5 V").mFaults.empty());
    CHECK(FaultsText(
              ReadRomanText("m1 C: I\nM2 C: I\nm3. V: C\nm9999999 C: V\nm7-5 C: I\n").mFaults) ==
          "2:1 a measure is written m1, m1a or m1-4; "
          "3:1 a measure is written m1, m1a or m1-4; "
          "4:1 a measure is written m1, m1a or m1-4; "
          "5:1 a measure is written m1, m1a or m1-4");
    CHECK(FaultsText(reading.mNotes) ==
          "3:1 another reading of the measure is left out; 10:1 pedals are left out");
}

TEST_CASE("Hostile analyses end") {
    CHECK(ReadRomanText("").mChords.empty());
    CHECK(ReadRomanText(std::string(300000, 'm')).mFaults.size() == 1);
    CHECK(FaultsText(ReadRomanText("m1 C: I\nm2 =\n").mFaults) ==
          "2:5 measures are expected behind =");
    const CRomanTextReading gap = ReadRomanText("m1 C: I\nm999999 V\n");
    CHECK(gap.mBars.size() == 100'000);
    CHECK(FaultsText(gap.mFaults) == "2:1 there are too many measures");
    std::string copies = "m1 C:";
    for (int i = 0; i < 5000; ++i) copies += " ||";
    for (int i = 2; i < 3000; ++i) copies += "\nm" + std::to_string(i) + " = m1";
    const CRomanTextReading reading = ReadRomanText(copies);
    CHECK(reading.mFaults.back().mText == "too much is copied");
    CHECK(reading.mFaults.size() <= 1000);
    CHECK(ReadRomanText("m99999999999999999999 I\nm-1 I\nm1- I\nm5-2 = m1\n").mFaults.size() == 4);
}

}  // namespace
}  // namespace brindle::test
