// SPDX-License-Identifier: MIT
#include "brindle/chords/NameNotes.h"
#include "brindle/chords/CProgressionSpelling.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <random>
#include <string>
#include <vector>

namespace brindle::test {
namespace {

std::vector<CNote> Midi(const std::vector<int>& numbers) {
    std::vector<CNote> notes;
    for (const int number : numbers) notes.emplace_back(number, TEnh_Undef);
    return notes;
}

std::string FirstSymbol(const std::vector<CNamedChord>& names) {
    return names.empty() ? "" : names.front().mSymbol;
}

std::string DegreesText(const std::vector<CChordDegree>& degrees) {
    std::string text;
    for (const CChordDegree& degree : degrees) text += (text.empty() ? "" : " ") + degree.Name();
    return text;
}

TEST_CASE("Players' names of chords that a root alone does not tell") {
    struct CRow {
        std::vector<int> mNotes;
        const char* mSymbol;
    };
    for (const CRow& row : std::vector<CRow>{
             {{48, 62, 64, 66, 67, 70}, "C9#11"},
             {{45, 52, 55, 60, 64}, "Am7"},
             {{48, 52, 55, 57}, "C6"},
             {{55, 57, 60, 63}, "Cm6/G"},
             {{48, 52, 54}, "C(b5)"},
             {{50, 60, 64, 67}, "C/D"},
         }) {
        CHECK(FirstSymbol(NameNotes(Midi(row.mNotes))) == row.mSymbol);
    }
}

TEST_CASE("A figure behind a root with two signs does not take one of them") {
    bool isSeen = false;
    for (const CNamedChord& name : NameNotes(std::vector{CNote(69, TEnh_bb), CNote(60, TEnh_bb)})) {
        if (name.mRoot.mKeyNr != 0) continue;
        isSeen = true;
        CHECK(name.mExactSymbol == "Dbb 6(no3,no5)");
        CHECK(ReadChordText(name.mExactSymbol).mChord.mRootKeyEnh == CKeyEnh{0, TEnh_bb});
    }
    CHECK(isSeen);
}

TEST_CASE("A named chord tells its bass, what is left out and what is added") {
    const CNamedChord seventh = NameNotes(Midi({48, 52, 58})).front();
    CHECK(seventh.mSymbol == "C7");
    CHECK(seventh.mExactSymbol == "C7(no5)");
    CHECK(DegreesText(seventh.mOmitted) == "5");
    CHECK(seventh.mAdded.empty());
    CHECK(seventh.mBass.IsUndef());

    const CNamedChord cluster = NameNotes(Midi({60, 61, 62, 63})).front();
    CHECK(cluster.mSymbol == "Cm(b9,add9,no5)");
    CHECK(DegreesText(cluster.mAdded) == "b9 9");
    CHECK(DegreesText(cluster.mOmitted) == "5");

    const CNamedChord overBass = NameNotes(Midi({50, 60, 64, 67})).front();
    CHECK(overBass.mBass == CKeyEnh_D);
    CHECK(overBass.mChord == CChordLite(CKeyEnh_C, CKeyEnh_D, CSemitones(0x091)));
}

TEST_CASE("Notes keep the names that they came with, from the lowest note up") {
    const std::vector<CNote> typed{{68, TEnh_s}, {61, TEnh_s}, {65, TEnh_s}};
    const CNamedChord named = NameNotes(typed).front();
    CHECK(named.mSymbol == "C#");
    CHECK(named.mNotes == std::vector<CNote>{{61, TEnh_s}, {65, TEnh_s}, {68, TEnh_s}});
    const CNamedChord numbered = NameNotes(Midi({68, 61, 65, 61})).front();
    CHECK(numbered.mSymbol == "Db");
    CHECK(numbered.mNotes == std::vector<CNote>{{61, TEnh_b}, {65, TEnh_n}, {68, TEnh_b}});
}

TEST_CASE("There is no name without notes, and there are no more names than are wanted") {
    CHECK(NameNotes({}).empty());
    CHECK(NameNotes(std::vector<CNote>(3)).empty());
    CNamingOptions options;
    options.mLimit = 2;
    CHECK(NameNotes(Midi({60, 64, 67}), options).size() == 2);
}

TEST_CASE("The name over a wanted root comes first, and the others keep their order") {
    std::vector<CNamedChord> names = NameNotes(Midi({48, 52, 55, 57}));
    const auto symbols = [&names] {
        std::string text;
        for (const CNamedChord& name : names) text += name.mSymbol + ' ';
        return text;
    };
    const std::string asFound = symbols();
    CHECK_FALSE(PutRootFirst(names, 1));
    CHECK(symbols() == asFound);
    CHECK(PutRootFirst(names, 9));
    CHECK(symbols().starts_with("Am7/C C6 Fmaj9/C "));
}

TEST_CASE("Names do not depend on the order of notes, and move with them") {
    std::mt19937 random(7);
    for (int round = 0; round < 300; ++round) {
        std::vector<int> numbers;
        for (auto count = 2 + random() % 5; count > 0; --count) {
            numbers.push_back(40 + static_cast<int>(random() % 30));
        }
        const auto names = NameNotes(Midi(numbers));
        auto shuffled = numbers;
        std::shuffle(shuffled.begin(), shuffled.end(), random);
        shuffled.push_back(shuffled.front());
        CHECK(FirstSymbol(NameNotes(Midi(shuffled))) == FirstSymbol(names));

        for (int& number : numbers) number += 5;
        const auto moved = NameNotes(Midi(numbers));
        REQUIRE(moved.size() == names.size());
        for (std::size_t ix = 0; ix < names.size(); ++ix) {
            INFO(names[ix].mSymbol, " and ", moved[ix].mSymbol);
            CHECK(moved[ix].mCost == names[ix].mCost);
            CHECK(moved[ix].mSuffix == names[ix].mSuffix);
            CHECK(moved[ix].mRoot.mKeyNr == (names[ix].mRoot.mKeyNr + 5) % 12);
        }
    }
}

TEST_CASE("A progression names an ambiguous chord by where it goes") {
    const auto symbols = [](const std::vector<std::vector<int>>& chords) {
        std::vector<std::vector<CNote>> sets;
        for (const auto& chord : chords) sets.push_back(Midi(chord));
        std::string text;
        for (const auto& names : NameProgression(sets)) text += FirstSymbol(names) + ' ';
        return text;
    };
    const std::vector<int> ambiguous{52, 55, 57, 60};  // A minor seventh or C sixth, over E
    CHECK(symbols({ambiguous}) == "Am7/E ");
    CHECK(symbols({{47, 50, 56, 64}, ambiguous, {50, 54, 57, 60}}) == "E7/B Am7/E D7 ");
    CHECK(symbols({{43, 53, 59, 62}, ambiguous, {43, 53, 59, 62}}) == "G7 C6/E G7 ");
    // Silence between two chords does not part them.
    CHECK(symbols({{43, 53, 59, 62}, {}, ambiguous, {}, {43, 53, 59, 62}}) == "G7  C6/E  G7 ");
    CHECK(symbols({}).empty());
}

TEST_CASE("Roots are spelled by the key, basses by their chord where the key agrees") {
    struct CRow {
        CSignKeyLite mKey;
        std::vector<const char*> mChords;
        const char* mSpelled;
    };
    const CSignKeyLite c(CKeyEnh_C, TSignKeyType_Major);
    const CSignKeyLite e(CKeyEnh_E, TSignKeyType_Major);
    const CRow rows[] = {
        {c, {"C", "Dbdim7", "Dm7"}, "C C#dim7 Dm7 "},
        {c, {"D7/Gb", "Ab7/Gb"}, "D7/F# Ab7/F# "},  // a third and a seventh on one key
        {c, {"G#7/Gb"}, "Ab7/Gb "},
        {e, {"Bb7"}, "A#7 "},
        {e, {"C/A#"}, "C/Bb "},  // a seventh below, though the chord has none
        {e, {"Eb7/G"}, "D#7/G "},
        {{CKeyEnh_A, TSignKeyType_Minor}, {"D#7", "Ab7"}, "Eb7 G#7 "},
    };
    for (const CRow& row : rows) {
        std::vector<CChordLite> chords;
        for (const char* symbol : row.mChords) chords.push_back(ReadChordText(symbol).mChord);
        const CProgressionSpelling spelling(row.mKey, chords);
        std::string spelled;
        for (const CChordLite& chord : chords) {
            spelled += WriteChordSymbol(spelling.Spelled(chord)) + " ";
        }
        CHECK(spelled == row.mSpelled);
    }
}

TEST_CASE("A symbol is written in the style that is asked for") {
    const auto symbolOf = [](const std::vector<int>& notes, const CChordNamePrefs& prefs) {
        return NamedChordSymbol(NameNotes(Midi(notes)).front(), prefs);
    };
    const std::vector<int> halfDiminished{58, 61, 64, 68};
    const std::vector<int> majorSeventh{56, 60, 63, 67};
    CHECK(symbolOf(halfDiminished, {}) == "B\u266Dm7\u266D5");
    CHECK(symbolOf(halfDiminished,
                   {.mBForBFlat = true, .mGermanNames = true, .mAsciiAccidentals = 1}) == "Bm7b5");
    CHECK(symbolOf(halfDiminished, {.mAsciiAccidentals = 1, .mSolfege = true}) == "Tibm7b5");
    CHECK(symbolOf(halfDiminished, {.mAsciiAccidentals = 1, .mLowerCaseMinorRoot = true}) ==
          "bbm7b5");
    CHECK(symbolOf(majorSeventh, {.mGermanNames = true, .mChordPrefC = 1}) == "Asj7");
    CHECK(symbolOf(majorSeventh, {.mAsciiAccidentals = 1}) == "Abma7");
    CHECK(symbolOf({52, 55, 60}, {.mNoSpaceAroundSlash = 0, .mSlashText = "|"}) == "C | E");
    CHECK(NamedChordSymbol(CNamedChord(), {}).empty());
}

TEST_CASE("Symbols in styles with letters are read back as the same chord") {
    for (const bool isGerman : {false, true}) {
        for (const int majorSeventh : {0, 1, 2}) {
            CChordNamePrefs prefs;
            prefs.mGermanNames = isGerman;
            prefs.mHForB = isGerman;
            prefs.mBForBFlat = isGerman;
            prefs.mChordPrefC = majorSeventh;
            for (unsigned keys = 1; keys < 4096; keys += 2) {
                std::vector<CNote> notes;
                for (int key = 0; key < 12; ++key) {
                    if ((keys >> key & 1U) != 0) notes.emplace_back(48 + key, TEnh_Undef);
                }
                const CNamedChord named = NameNotes(notes).front();
                const std::string symbol = NamedChordSymbol(named, prefs, true);
                const auto read = ReadChordText(symbol, {.mBIsBFlat = isGerman});
                INFO(symbol);
                CHECK(read.mChord == ReadChordText(named.mExactSymbol).mChord);
            }
        }
    }
}

}  // namespace
}  // namespace brindle::test
