// SPDX-License-Identifier: MIT
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <doctest/doctest.h>

#include <array>
#include <fstream>
#include <set>
#include <string>

namespace brindle::test {
namespace {

CChordLite Chord(std::string_view symbol) {
    return {symbol, ChordNamePrefsNonUTF8};
}

CSignKeyLite Key(std::string_view name) {
    return CSignKeyLite(name);
}

struct CNumeralCase {
    std::string_view mKey;
    std::string_view mChord;
    std::string_view mNext;  ///< empty for the last chord
    std::string_view mRoman;
    std::string_view mFigured;
    std::string_view mNashville;
};

// clang-format off
constexpr auto kCases = std::to_array<CNumeralCase>({
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
    {"C major", "G13",     "C",   "V13",         "V13",       "513"},
    {"C major", "Gsus4",   "",    "Vsus",        "Vsus",      "5sus"},
    {"C major", "Gsus2",   "",    "Vsus2",       "Vsus2",     "5sus2"},
    {"C major", "C5",      "",    "I5",          "I5",        "15"},
    {"C major", "Gaug",    "C",   "V+",          "V+",        "5+"},
    // The bass
    {"C major", "C/E",     "",    "I/^3",         "I6",        "1/^3"},
    {"C major", "G7/B",    "C",   "V7/^7",        "V65",       "57/^7"},
    {"C major", "G7/F",    "C",   "V7/^4",        "V42",       "57/^4"},
    {"C major", "C/G",     "",    "I/^5",         "I64",       "1/^5"},
    {"C major", "Dm7/A",   "",    "ii7/^6",       "ii43",      "2-7/^6"},
    {"C major", "F/G",     "",    "IV/^5",        "IV/^5",      "4/^5"},
    {"C major", "C/C",     "",    "I",           "I",         "1"},
    {"C minor", "Ab/C",    "",    "VI/^1",        "VI6",       "6/^1"},
    {"C major", "A7/C#",   "Dm",  "V7/ii/^#1",   "V65/ii",    "67/^#1"},
    {"C major", "C/Bb",    "",    "I/^b7",       "I/^b7",     "1/^b7"},
    {"C major", "Cm/D#",   "",    "i/^#2",        "i/^#2",     "1-/^#2"},
    {"C major", "G7/E#",   "",    "V7/^#3",       "V7/^#3",    "57/^#3"},
    {"A minor", "E7/G#",   "Am",  "V7/^#7",      "V65",       "57/^#7"},
    // All tones
    {"C major", "C7b5",    "",    "I7b5",        "I7b5",      "17b5"},
    {"C major", "Cmaj7#5", "",    "I^7#5",       "I^7#5",     "1^7#5"},
    {"C major", "C9",      "F",   "V9/IV",       "V9/IV",     "19"},
    {"C major", "G7(b9)(#11)", "C", "V7b9#11",   "V7b9#11",   "57b9#11"},
    {"C major", "Cadd9/E", "",    "Iadd9/^3",    "Iadd9/^3",  "1add9/^3"},
    {"C minor", "Cm(maj7)(9)", "", "i^9",        "i^9",       "1-^9"},
    // In minor a diminished chord on vii is raised if no flat holds it
    {"A minor", "Gdim7",   "",    "bviio7",      "bviio7",    "7o7"},
    {"A minor", "Fdim",    "",    "vio",         "bvio",      "6o"},
    // Dominants of other degrees
    {"C major", "A7",      "Dm",  "V7/ii",       "V7/ii",     "67"},
    {"C major", "D7",      "G7",  "V7/V",        "V7/V",      "27"},
    {"C major", "C7",      "F",   "V7/IV",       "V7/IV",     "17"},
    {"C major", "Eb7",     "Dm7", "subV7/ii",    "subV7/ii",  "b37"},
    {"C major", "C#dim7",  "Dm",  "viio7/ii",    "viio7/ii",  "b2o7"},
    {"C major", "F#dim",   "G",   "viio/V",      "viio/V",    "#4o"},
    {"C major", "D7/F#",   "G",   "V7/V/^#4",     "V65/V",     "27/^#4"},
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
    for (const CNumeralCase& row : kCases) {
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

constexpr auto kWays = std::to_array<CNumeralOptions>({
    {},
    {.mFigures = true},
    {.mPrintedSigns = true},
    {.mByKey = true},
    {.mFigures = true, .mByKey = true},
    {.mNashville = true},
    {.mNashville = true, .mFigures = true},
});

CSignKeyLite KeyNumber(int number) {
    CSignKeyLite key({number % 12, TEnh_Undef},
                     number < 12 ? TSignKeyType_Major : TSignKeyType_Minor);
    key.SetRootNoteEnhWithLeastSigns();
    return key;
}

bool IsSameSound(const CChordLite& a, const CChordLite& b) {
    const auto bassOf = [](const CChordLite& chord) {
        return chord.HasBassNote() ? chord.mBassKeyEnh.mKeyNr : chord.mRootKeyEnh.mKeyNr;
    };
    return a.mRootKeyEnh.mKeyNr == b.mRootKeyEnh.mKeyNr && bassOf(a) == bassOf(b) &&
           a.mSemitones == b.mSemitones;
}

// The number of chords that are not read as they were written; the first of them are told.
int FaultsOfLaw(CSemitones tones, int step, CSemitones nextTones) {
    int faults = 0;
    for (int number = 0; number < 24; ++number) {
        const CSignKeyLite key = KeyNumber(number);
        for (int root = 0; root < 12; ++root) {
            const int bass = step * (number + 7 * root) % 12;
            const CChordLite chord{{root, TEnh_Undef}, {(root + bass) % 12, TEnh_Undef}, tones};
            const CChordLite next{
                {(root + 5 + 8 * (bass % 3)) % 12, TEnh_Undef}, CKeyEnh_Undef, nextTones};
            for (const CNumeralOptions& way : kWays) {
                const std::string numeral = RomanNumeral(chord, key, &next, way);
                const auto read = ChordFromNumeral(numeral, key, way);
                if (read && IsSameSound(*read, chord)) continue;
                INFO(numeral << " in key " << number << ", root " << root);
                if (++faults < 3) CHECK((read && IsSameSound(*read, chord)));
            }
        }
    }
    return faults;
}

TEST_CASE("Every type of chord, over every bass, in every key is read with all its tones") {
    std::ifstream file(BRINDLE_TEST_DATA "/chord-spellings.tsv");
    std::string line;
    std::getline(file, line);
    std::set<std::uint64_t> masks;
    while (std::getline(file, line)) {
        const CChordTextReading reading = ReadChordText(line.substr(0, line.find('\t')));
        if (!reading.mChord.IsUndef()) masks.insert(reading.mChord.mSemitones.Mask());
    }
    REQUIRE(masks.size() > 60);
    int faults = 0;
    for (const std::uint64_t mask : masks) {
        faults += FaultsOfLaw(CSemitones(mask), 0, CSemitones{0, 3, 7});
        faults += FaultsOfLaw(CSemitones(mask), 1, CSemitones{0, 4, 7});
    }
    CHECK(faults == 0);
}

TEST_CASE("Every set of tones is read as it was written") {
    int faults = 0;
    for (std::uint64_t mask = 1; mask < 4096; ++mask) {
        const CSignKeyLite key = KeyNumber(static_cast<int>(mask % 24));
        for (const CNumeralOptions& way : kWays) {
            const CChordLite chord{
                {static_cast<int>(mask % 11), TEnh_Undef}, CKeyEnh_Undef, CSemitones(mask)};
            const std::string numeral = RomanNumeral(chord, key, nullptr, way);
            const auto read = ChordFromNumeral(numeral, key, way);
            if (read && IsSameSound(*read, chord)) continue;
            INFO(numeral << " for " << mask);
            if (++faults < 10) CHECK((read && IsSameSound(*read, chord)));
        }
    }
    CHECK(faults == 0);
}

TEST_CASE("The bass is spelled as it was wherever the key spells the root as it was") {
    std::size_t same = 0;
    for (const char* text : {"C", "G7/B", "A7/C#", "D/F#", "E7/G#", "B7/D#", "Db/F", "Eb7/Db",
                             "Ab/Gb", "F#m7b5/C", "Bdim7/Ab", "C/Bb", "C7/A#", "Gm/Bb", "E/B#"}) {
        const CChordLite chord = Chord(text);
        for (int number = 0; number < 24; ++number) {
            const CSignKeyLite key = KeyNumber(number);
            const auto read = ChordFromNumeral(RomanNumeral(chord, key), key);
            REQUIRE(read);
            INFO(text << " in key " << number);
            CHECK(IsSameSound(*read, chord));
            if (read->mRootKeyEnh != chord.mRootKeyEnh) continue;
            CHECK(read->mBassKeyEnh == chord.mBassKeyEnh);
            ++same;
        }
    }
    CHECK(same > 200);
}

struct CReadCase {
    std::string_view mKey;
    std::string_view mNumeral;
    std::string_view mChord;
};

// clang-format off
constexpr auto kReadCases = std::to_array<CReadCase>({
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
    for (const CReadCase& row : kReadCases) {
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
         {"",      "/",     "//",           "b",    "###I",  "8",      "0",        "X",
          "Iv",    "iI",    "VIII",         "V7x",  "V7/",   "/V",     "V/8",      "V77",
          "V7//V", "I/3/5", "I/H",          "I/e",  "I/E7",  "subIV7", "bsubV",    "I/^E",
          "I/^",   "I/3/V", "\xC3",         "I 7",  "I[",    "I]",     "I[]]",     "I[no]",
          "I[x3]", "Vno8x", "V[no1no3no5]", "Ger9", "V7/Vx", "vii/x",  "V\xE2\x99"}) {
        INFO(std::string(text));
        CHECK_FALSE(ChordFromNumeral(text, Key("C major")));
        CHECK_FALSE(ReadNumeral(text, Key("C major"), {.mFigures = true}).mFault.empty());
    }
    CHECK_FALSE(ChordFromNumeral("I", CSignKeyLite_Undef));
    CHECK_FALSE(ChordFromNumeral(std::string(1000000, '/'), Key("C major")));
    const CSignKeyLite odd({-2147483647 - 1, static_cast<TEnh>(99)}, static_cast<TSignKeyType>(9));
    CHECK(ChordFromNumeral("bVI/3", odd));
    CHECK_FALSE(RomanNumeral(Chord("G7/B"), odd).empty());
}

}  // namespace
}  // namespace brindle::test
