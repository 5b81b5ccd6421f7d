// SPDX-License-Identifier: MIT
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/analysis/internal/KeyChords.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <doctest/doctest.h>

#include <array>

namespace brindle::test {
namespace {

CChordLite Chord(std::string_view symbol) {
    return {symbol, ChordNamePrefsNonUTF8};
}

CSignKeyLite Key(std::string_view name) {
    return CSignKeyLite(name);
}

struct TNumeralCase {
    std::string_view mKey;
    std::string_view mChord;
    std::string_view mNext;  ///< empty for the last chord
    std::string_view mRoman;
    std::string_view mFigured;
    std::string_view mNashville;
};

// clang-format off
constexpr auto kCases = std::to_array<TNumeralCase>({
    // key      chord      next   Roman          figured      Nashville
    // The degrees of both modes
    {"C major", "C",       "",    "I",           "I",         "1"},
    {"C major", "Dm7",     "G7",  "ii7",         "ii7",       "2-7"},
    {"C major", "Eb",      "",    "bIII",        "bIII",      "b3"},
    {"C major", "F#m7b5",  "",    "#ivh7",       "#ivh7",     "#4h7"},
    {"C major", "Bb7",     "",    "bVII7",       "bVII7",     "b77"},
    {"A minor", "C",       "",    "III",         "III",       "3"},
    {"A minor", "G#dim7",  "Am",  "#viio7",      "#viio7",    "#7o7"},
    {"A minor", "F#m7b5",  "",    "#vih7",       "#vih7",     "#6h7"},
    {"A minor", "Bb",      "E7",  "bII",         "bII",       "b2"},
    // The kinds of chords
    {"Eb major", "Ebmaj7", "",    "I^7",         "I^7",       "1^7"},
    {"C major", "C6",      "",    "I6",          "Iadd6",     "16"},
    {"C minor", "Cm6",     "",    "i6",          "iadd6",     "1-6"},
    {"C minor", "Cm(maj7)", "",   "i^7",         "i^7",       "1-^7"},
    {"C major", "Dm13",    "",    "ii13",        "ii13",      "2-13"},
    {"C major", "G13",     "C",   "V7",          "V7",        "57"},
    {"C major", "Gsus4",   "",    "Vsus",        "Vsus",      "5sus"},
    {"C major", "Gsus2",   "",    "Vsus2",       "Vsus2",     "5sus2"},
    {"C major", "C5",      "",    "I5",          "I5",        "15"},
    {"C major", "Gaug",    "C",   "V+",          "V+",        "5+"},
    // The bass
    {"C major", "C/E",     "",    "I/3",         "I6",        "1/3"},
    {"C major", "G7/B",    "C",   "V7/7",        "V65",       "57/7"},
    {"C major", "G7/F",    "C",   "V7/4",        "V42",       "57/4"},
    {"C major", "C/G",     "",    "I/5",         "I64",       "1/5"},
    {"C major", "Dm7/A",   "",    "ii7/6",       "ii43",      "2-7/6"},
    {"C major", "F/G",     "",    "IV/5",        "IV/5",      "4/5"},
    {"C major", "C/C",     "",    "I",           "I",         "1"},
    {"C minor", "Ab/C",    "",    "VI/1",        "VI6",       "6/1"},
    // Dominants of other degrees
    {"C major", "A7",      "Dm",  "V7/ii",       "V7/ii",     "67"},
    {"C major", "D7",      "G7",  "V7/V",        "V7/V",      "27"},
    {"C major", "C7",      "F",   "V7/IV",       "V7/IV",     "17"},
    {"C major", "Eb7",     "Dm7", "subV7/ii",    "subV7/ii",  "b37"},
    {"C major", "C#dim7",  "Dm",  "viio7/ii",    "viio7/ii",  "b2o7"},
    {"C major", "F#dim",   "G",   "viio/V",      "viio/V",    "#4o"},
    {"C major", "D7/F#",   "G",   "V7/V/#4",     "V65/V",     "27/#4"},
    {"C minor", "Bb7",     "Eb",  "V7/III",      "V7/III",    "77"},
    // ... and what is none: the next root is the tonic, or no degree, or the chord is the dominant
    {"C major", "Db7",     "C",   "bII7",        "bII7",      "b27"},
    {"C major", "Bdim7",   "C",   "viio7",       "viio7",     "7o7"},
    {"C major", "B7",      "Eb",  "VII7",        "VII7",      "77"},
    {"C major", "Bb7",     "Eb",  "bVII7",       "bVII7",     "b77"},
    {"C major", "Am7",     "Dm7", "vi7",         "vi7",       "6-7"},
});
// clang-format on

TEST_CASE("Chords are written as numerals, and numerals are read as chords") {
    for (const TNumeralCase& row : kCases) {
        INFO(row.mKey << ": " << row.mChord << " before " << row.mNext);
        const CSignKeyLite key = Key(row.mKey);
        const CChordLite chord = Chord(row.mChord);
        const CChordLite next = row.mNext.empty() ? CChordLite_Undef : Chord(row.mNext);
        CHECK(RomanNumeral(chord, key, &next) == row.mRoman);
        CHECK(RomanNumeral(chord, key, &next, {.mFigures = true}) == row.mFigured);
        CHECK(RomanNumeral(chord, key, &next, {.mNashville = true}) == row.mNashville);
    }
    CHECK(RomanNumeral(CChordLite_Undef, Key("C major")).empty());
    CHECK(RomanNumeral(Chord("C"), CSignKeyLite_Undef).empty());
    CHECK(RomanNumeral(Chord("Bm7b5"), Key("C major"), nullptr, {.mPrintedSigns = true}) ==
          "vii\u00F87");
    CHECK(RomanNumeral(Chord("Bdim"), Key("C major"), nullptr, {.mPrintedSigns = true}) ==
          "vii\u00B0");
}

constexpr auto kKindOfClass = std::to_array<CSemitones>({
    {0, 4, 7},
    {0, 4, 7, 11},
    {0, 4, 7, 10},
    {0, 3, 7},
    {0, 3, 7, 10},
    {0, 3, 6, 10},
    {0, 3, 6, 9},
    {0, 5, 7},
});
static_assert(kKindOfClass.size() == kKeyChordClassCount);

bool IsSameSound(const CChordLite& a, const CChordLite& b) {
    const auto bassOf = [](const CChordLite& chord) {
        return chord.HasBassNote() ? chord.mBassKeyEnh.mKeyNr : chord.mRootKeyEnh.mKeyNr;
    };
    return a.mRootKeyEnh.mKeyNr == b.mRootKeyEnh.mKeyNr && bassOf(a) == bassOf(b) &&
           KeyChordClassOf(a.mSemitones) == KeyChordClassOf(b.mSemitones);
}

TEST_CASE("Every degree of every key in every class, over every bass, is read as it was written") {
    constexpr auto ways = std::to_array<TNumeralOptions>({
        {},
        {.mFigures = true},
        {.mPrintedSigns = true},
        {.mNashville = true},
        {.mNashville = true, .mFigures = true},
    });
    std::size_t faults = 0;
    for (int number = 0; number < 24; ++number) {
        CSignKeyLite key({number % 12, TEnh_Undef},
                         number < 12 ? TSignKeyType_Major : TSignKeyType_Minor);
        key.SetRootNoteEnhWithLeastSigns();
        for (int root = 0; root < 12; ++root) {
            for (const CSemitones kind : kKindOfClass) {
                for (int bass = 0; bass < 12; ++bass) {
                    const CChordLite chord{{root, TEnh_Undef}, {bass, TEnh_Undef}, kind};
                    const CChordLite next{
                        {(root + bass) % 12, TEnh_Undef}, CKeyEnh_Undef, kKindOfClass[3]};
                    for (const TNumeralOptions& way : ways) {
                        const std::string numeral = RomanNumeral(chord, key, &next, way);
                        const auto read = ChordFromNumeral(numeral, key, way);
                        if (read && IsSameSound(*read, chord)) continue;
                        INFO(numeral << " in key " << number << ", root " << root);
                        if (++faults < 10) CHECK((read && IsSameSound(*read, chord)));
                    }
                }
            }
        }
    }
    CHECK(faults == 0);
}

struct TReadCase {
    std::string_view mKey;
    std::string_view mNumeral;
    std::string_view mChord;
};

// clang-format off
constexpr auto kReadCases = std::to_array<TReadCase>({
    // Spelled by the degree
    {"Eb major", "ii7",     "Fm7"},
    {"Eb major", "bVI",     "Cb"},
    {"F# major", "V7",      "C#7"},
    {"F# major", "#IV",     "B#"},
    {"C minor",  "VI^7",    "Abmaj7"},
    {"C minor",  "#viio7",  "Bdim7"},
    {"C minor",  "bVI",     "Ab"},
    {"C minor",  "bVII",    "Bb"},
    {"E major",  "V7/vi",   "G#7"},
    {"E major",  "viio7/ii", "E#dim7"},
    {"C major",  "subV7/V", "Ab7"},
    // As others write
    {"C major",  "IVmaj7",  "Fmaj7"},
    {"C major",  "viiø7",   "Bm7b5"},
    {"C major",  "vii°7",   "Bdim7"},
    {"C major",  "♭VII7",   "Bb7"},
    {"C major",  "V9",      "G9"},
    {"C major",  "V7b9/ii", "A7b9"},
    {"C major",  "ii7/V",   "Am7"},
    {"C major",  "I/E",     "C/E"},
    {"C major",  "I/b7",    "C/Bb"},
    {"Eb major", "V65",     "Bb7/D"},
    {"C major",  "viio6",   "Bdim/D"},
    // Nashville
    {"G major",  "2m7",     "Am7"},
    {"G major",  "57",      "D7"},
    {"G major",  "1maj7",   "Gmaj7"},
    {"G major",  "b3+",     "Bbaug"},
    {"G major",  "5/7",     "D/F#"},
});
// clang-format on

TEST_CASE("Numerals are read as musicians write them, and spelled by their degree") {
    for (const TReadCase& row : kReadCases) {
        INFO(row.mKey << ": " << row.mNumeral);
        const auto chord = ChordFromNumeral(row.mNumeral, Key(row.mKey));
        REQUIRE(chord);
        CHECK(*chord == Chord(row.mChord));
    }
    CHECK(*ChordFromNumeral("I6", Key("C major")) == Chord("C6"));
    CHECK(*ChordFromNumeral("I6", Key("C major"), {.mFigures = true}) == Chord("C/E"));
}

TEST_CASE("What is no numeral is no chord") {
    for (const char* text :
         {"",     "/",      "//",    "b",    "###I",  "8",     "0",         "X",     "Iv",  "iI",
          "VIII", "V7x",    "V7/",   "/V",   "V/8",   "V7/V7", "V7/V/V",    "I/3/5", "I/H", "I/e",
          "I/E7", "subIV7", "bsubV", "isus", "5-sus", "\xC3",  "V\xE2\x99", "I 7"}) {
        INFO(text);
        CHECK_FALSE(ChordFromNumeral(text, Key("C major")));
    }
    CHECK_FALSE(ChordFromNumeral("I", CSignKeyLite_Undef));
    CHECK_FALSE(ChordFromNumeral(std::string(1000000, '/'), Key("C major")));
    const CSignKeyLite odd({-2147483647 - 1, static_cast<TEnh>(99)}, static_cast<TSignKeyType>(9));
    CHECK(ChordFromNumeral("bVI/3", odd));
    CHECK_FALSE(RomanNumeral(Chord("G7/B"), odd).empty());
}

}  // namespace
}  // namespace brindle::test
