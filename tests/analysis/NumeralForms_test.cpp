// SPDX-License-Identifier: MIT
// What people write as numerals, and what is read of it.
#include "brindle/analysis/ReadNumerals.h"
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <array>
#include <chrono>
#include <string>

namespace brindle::test {
namespace {

constexpr CNumeralOptions kSigns{};
constexpr CNumeralOptions kFigures{.mFigures = true};
constexpr CNumeralOptions kByKey{.mFigures = true, .mByKey = true};

CSignKeyLite Key(std::string_view name) {
    return CSignKeyLite(name);
}

CChordLite Chord(std::string_view symbol) {
    const CChordTextReading reading = ReadChordText(symbol);
    INFO(std::string(symbol));
    REQUIRE(reading.mKind == TChordText_Chord);
    return reading.mChord;
}

struct CFormCase {
    std::string_view mKey;
    std::string_view mNumeral;
    std::string_view mChord;
    CNumeralOptions mOptions = kFigures;
};

// clang-format off
constexpr auto kForms = std::to_array<CFormCase>({
    // Figures, together and with slashes
    {"C major", "I6",         "C/E"},
    {"C major", "I6",         "C6",       kSigns},
    {"C major", "I63",        "C/E"},
    {"C major", "I6/4",       "C/G",      kSigns},
    {"C major", "I64",        "C/G",      kSigns},
    {"C major", "I53",        "C"},
    {"C major", "V6/5",       "G7/B",     kSigns},
    {"C major", "V65",        "G7/B",     kSigns},
    {"C major", "V6/5/3",     "G7/B"},
    {"C major", "V4/3",       "G7/D",     kSigns},
    {"C major", "V43",        "G7/D",     kSigns},
    {"C major", "V4/2",       "G7/F",     kSigns},
    {"C major", "V42",        "G7/F",     kSigns},
    {"C major", "V2",         "G7/F",     kSigns},
    {"C major", "ii2",        "Dm7/C",    kSigns},
    {"C major", "ii6/5/V",    "Am7/C"},
    {"C major", "V54",        "Gsus4"},
    {"C major", "V4",         "Gsus4"},
    {"C major", "V4-3",       "Gsus4"},
    {"C major", "V9-8",       "Gadd9"},
    {"C major", "V8-7",       "G"},
    {"C major", "V7-9",       "G7b9",     kSigns},
    {"C major", "I6/3",       "C/E",      kSigns},
    {"C major", "V75",        "G7(no3)"},
    {"C major", "V\xE2\x81\xB6\xE2\x82\x85", "G7/B"},
    // Qualities
    {"C major", "viio6/5",    "Bdim7/D",  kSigns},
    {"C major", "vii\xC2\xB0" "7", "Bdim7"},
    {"C major", "viio42",     "Bdim7/Ab"},
    {"C major", "vii\xC3\xB8" "7", "Bm7b5"},
    {"C major", "vii%7",      "Bm7b5"},
    {"C major", "viih65",     "Bm7b5/D"},
    {"C major", "vii/o7",     "Bm7b5"},
    {"C major", "vii/o43/V",  "F#m7b5/C"},
    {"C major", "I+",         "Caug"},
    {"C major", "V+6",        "Gaug/B"},
    {"C major", "IVM7",       "Fmaj7"},
    {"C major", "Imaj2",      "Cmaj7/B"},
    {"C major", "IM43",       "Cmaj7/G"},
    {"C major", "iM7",        "Cm(maj7)"},
    {"C major", "Id7",        "C7"},
    {"C major", "bVIId43",    "Bb7/F"},
    {"C major", "VI-7",       "Am7",      kSigns},
    {"C major", "IIm7b5",     "Dm7b5",    kSigns},
    {"C major", "IVmaj9",     "Fmaj9",    kSigns},
    {"C major", "V7alt",      "G7alt",    kSigns},
    {"C major", "V7(b9,#11)", "G7b9#11",  kSigns},
    {"C major", "V13#11",     "G13#11",   kSigns},
    {"C major", "isus4",      "Csus4",    kSigns},
    {"C major", "Ib7",        "C7",       kSigns},
    {"C major", "I[b7]",      "C7"},
    {"C major", "\xE2\x85\xB1" "7", "Dm7"},
    {"C major", "\xE2\x85\xB6\xC2\xB0", "Bdim"},
    // Chords of their own
    {"C major", "N",          "Db"},
    {"C major", "N6",         "Db/F",     kSigns},
    {"C minor", "bII6",       "Db/F"},
    {"A minor", "N6/V",       "F/A"},
    {"C major", "It6",        "Ab7(no5)"},
    {"C major", "Ger6",       "Ab7"},
    {"C minor", "Ger65",      "Ab7"},
    {"A minor", "Ger+6",      "F7"},
    {"C major", "Ger6/V",     "Eb7"},
    {"C major", "Fr43",       "D7b5/Ab"},
    {"C major", "Fr6",        "D7b5/Ab"},
    {"C major", "Cad64",      "C/G"},
    {"A minor", "Cad6/4",     "Am/E"},
    {"C major", "Cad64/v",    "Gm/D"},
    {"C major", "CTo7",       "Cdim7"},
    // Applied to another degree
    {"C major", "V7/V/V",     "A7"},
    {"C major", "viio43/iv/ii", "F#dim7/C"},
    {"C major", "iv/IV",      "Bbm"},
    {"C major", "VI/ii",      "Bb"},
    {"C major", "VI/II",      "B"},
    {"C major", "#viio7/ii",  "C#dim7"},
    {"C major", "viio7/ii",   "C#dim7"},
    {"C major", "V7/N",       "Ab7"},
    {"C major", "V7/V7",      "D7"},
    {"C major", "subV7/I",    "Db7",      kSigns},
    // The two habits of minor
    {"A minor", "viio7",      "G#dim7",   kSigns},
    {"A minor", "#viio7",     "G#dim7",   kSigns},
    {"A minor", "viih7",      "G#m7b5"},
    {"A minor", "bviio7",     "Gdim7"},
    {"A minor", "VII",        "G"},
    {"A minor", "bVII",       "G"},
    {"A minor", "-vii",       "Gm"},
    {"A minor", "#VII",       "G#"},
    {"A minor", "VI",         "F"},
    {"A minor", "#vi",        "F#m"},
    {"A minor", "vi",         "Fm",       kSigns},
    {"A minor", "vi",         "F#m",      kByKey},
    {"A minor", "vii7",       "Gm7",      kSigns},
    {"A minor", "vio7",       "Fdim7",    kSigns},
    {"A minor", "vio7",       "F#dim7"},
    {"A minor", "V7/vi",      "C#7",      kByKey},
    // What has no sign, as written and as in the key
    {"C major", "IV7",        "F7"},
    {"C major", "IV7",        "Fmaj7",    kByKey},
    {"C major", "I42",        "Cmaj7/B",  kByKey},
    {"C major", "V7",         "G7",       kByKey},
    {"A minor", "III+7",      "C+maj7",   kByKey},
    {"A minor", "V9",         "E9",       kSigns},
    {"A minor", "V9",         "E7b9",     kByKey},
    {"C major", "iv7",        "Fm7",      kByKey},
    // The bass, by degree and by name
    {"C major", "V7/7",       "G7/B",     kSigns},
    {"C major", "I/b7",       "C/Bb",     kSigns},
    {"C major", "V7/ii/^#1",  "A7/C#",    kSigns},
    {"A minor", "V/7",        "E/G",      kSigns},
    {"A minor", "V/^#7",      "E/G#",     kSigns},
    {"C major", "46/5",       "F6/G",     kSigns},
    // Tones left out, added and changed
    {"C major", "V[no3]",     "G5"},
    {"C major", "I[no3][no5]", "C1"},
    {"C major", "V7[no3][add4]", "G7sus4"},
    {"C major", "V6[no3][add4]", "Gsus4/C"},
    {"C major", "ii[add9]",   "Dm(add9)"},
    {"A minor", "V[add9]",    "E(b9)"},
    {"C major", "I[no5][add6]", "C6(no5)"},
    {"C major", "V[#5]",      "Gaug"},
    {"C major", "V7[b9]/ii",  "A7b9"},
});
// clang-format on

TEST_CASE("Numerals are read in all the ways that people write them") {
    for (const CFormCase& row : kForms) {
        INFO(std::string(row.mKey) << ": " << std::string(row.mNumeral));
        const CNumeralReading reading = ReadNumeral(row.mNumeral, Key(row.mKey), row.mOptions);
        CHECK(reading.mFault == "");
        if (row.mChord == "C1") {
            CHECK(reading.mChord.mSemitones == CSemitones{0});
        } else {
            CHECK(reading.mChord == Chord(row.mChord));
        }
    }
}

struct CSignCase {
    std::string_view mSign;
    CSemitones mLarge;  ///< empty where only small numerals have the sign
    CSemitones mSmall;
};

// The signs of an analysis that takes chords for a few kinds.
// clang-format off
constexpr auto kSignsOfKinds = std::to_array<CSignCase>({
    {"",     {0, 4, 7},     {0, 3, 7}},
    {"6",    {0, 4, 7, 9},  {0, 3, 7, 9}},
    {"7",    {0, 4, 7, 10}, {0, 3, 7, 10}},
    {"^7",   {0, 4, 7, 11}, {0, 3, 7, 11}},
    {"+",    {0, 4, 8},     {}},
    {"+7",   {0, 4, 8, 10}, {}},
    {"h7",   {},            {0, 3, 6, 10}},
    {"o",    {},            {0, 3, 6}},
    {"o7",   {},            {0, 3, 6, 9}},
    {"5",    {0, 7},        {}},
    {"sus",  {0, 5, 7},     {}},
    {"sus2", {0, 2, 7},     {}},
    {"7sus", {0, 5, 7, 10}, {}},
});

constexpr std::array<std::string_view, 12> kMajorNames{
    "I", "bII", "II", "bIII", "III", "IV", "#IV", "V", "bVI", "VI", "bVII", "VII"};
constexpr std::array<std::string_view, 12> kMinorNames{
    "I", "bII", "II", "III", "#III", "IV", "#IV", "V", "VI", "#VI", "VII", "#VII"};
// clang-format on

std::string Small(std::string_view name) {
    std::string small(name);
    for (char& c : small) {
        if (c == 'I') c = 'i';
        if (c == 'V') c = 'v';
    }
    return small;
}

void CheckRead(const std::string& numeral, const CSignKeyLite& key, int root, CSemitones tones) {
    if (tones.IsEmpty()) return;
    INFO(numeral << (key.mSignKeyType == TSignKeyType_Minor ? " in minor" : " in major"));
    const CNumeralReading reading = ReadNumeral(numeral, key);
    CHECK(reading.mFault == "");
    CHECK(reading.mChord.mRootKeyEnh.mKeyNr == (root + key.mRootKeyEnh.mKeyNr) % 12);
    CHECK(reading.mChord.mSemitones == tones);
}

TEST_CASE("Each sign on each degree is read as that kind of chord") {
    for (const char* name : {"C major", "Eb major", "C minor", "F# minor"}) {
        const CSignKeyLite key = Key(name);
        const bool isMinor = key.mSignKeyType == TSignKeyType_Minor;
        for (int root = 0; root < 12; ++root) {
            const auto ix = static_cast<std::size_t>(root);
            const std::string degree(isMinor ? kMinorNames[ix] : kMajorNames[ix]);
            for (const CSignCase& sign : kSignsOfKinds) {
                const std::string text(sign.mSign);
                CheckRead(degree + text, key, root, sign.mLarge);
                // The leading tone needs no sharp where the chord tells it.
                const bool isLeading = isMinor && root == 10 && sign.mLarge.IsEmpty();
                CheckRead(Small(degree) + text, key, isLeading ? 11 : root, sign.mSmall);
            }
        }
    }
}

struct CAppliedCase {
    std::string_view mNumeral;
    int mRoot;  ///< in semitones above the target
    CSemitones mTones;
};

TEST_CASE("What is applied to a degree counts from it") {
    constexpr auto cases = std::to_array<CAppliedCase>({
        {"V", 7, {0, 4, 7}},
        {"V7", 7, {0, 4, 7, 10}},
        {"V+7", 7, {0, 4, 8, 10}},
        {"viio7", 11, {0, 3, 6, 9}},
        {"viih7", 11, {0, 3, 6, 10}},
        {"ii7", 2, {0, 3, 7, 10}},
        {"iih7", 2, {0, 3, 6, 10}},
        {"ii^7", 2, {0, 3, 7, 11}},
        {"subV7", 1, {0, 4, 7, 10}},
        {"subV+7", 1, {0, 4, 8, 10}},
    });
    for (const char* name : {"C major", "Ab major", "C minor", "B minor"}) {
        const CSignKeyLite key = Key(name);
        const bool isMinor = key.mSignKeyType == TSignKeyType_Minor;
        for (int target = 0; target < 12; ++target) {
            const auto ix = static_cast<std::size_t>(target);
            const std::string degree(isMinor ? kMinorNames[ix] : kMajorNames[ix]);
            for (const CAppliedCase& row : cases) {
                const std::string numeral = std::string(row.mNumeral) + "/";
                CheckRead(numeral + degree, key, (row.mRoot + target) % 12, row.mTones);
                CheckRead(numeral + Small(degree), key, (row.mRoot + target) % 12, row.mTones);
            }
        }
    }
}

TEST_CASE("A suspension with its resolution is the suspension above the root") {
    struct CCase {
        std::string_view mKey;
        std::string_view mNumeral;
        CSemitones mTones;
    };
    constexpr auto cases = std::to_array<CCase>({
        {"C major", "V6-5", {0, 4, 9}},
        {"C major", "V64-53", {0, 5, 9}},
        {"A minor", "V64-53", {0, 5, 8}},
        {"A minor", "i6-5", {0, 3, 8}},
        {"C major", "I9-8", {0, 2, 4, 7}},
        {"C major", "V8-7", {0, 4, 7}},
        {"C major", "V54-3", {0, 5, 7}},
        {"C major", "V74-3", {0, 5, 7, 10}},
    });
    for (const CCase& row : cases) {
        for (const CNumeralOptions& options : {kSigns, kFigures, kByKey}) {
            INFO(std::string(row.mNumeral));
            const CNumeralReading reading = ReadNumeral(row.mNumeral, Key(row.mKey), options);
            CHECK(reading.mChord.mSemitones == row.mTones);
            CHECK_FALSE(reading.mChord.HasBassNote());
        }
    }
}

struct CFaultCase {
    std::string_view mText;
    std::string_view mFault;
    std::size_t mOffset;
};

TEST_CASE("A fault tells what is wrong and where") {
    constexpr std::string_view noDegree = "this is no degree";
    constexpr std::string_view noSign = "this sign behind the degree is not understood";
    constexpr std::string_view noTarget = "a degree or a bass is expected behind the slash";
    constexpr std::string_view noGroup = "what stands in brackets is not understood";
    constexpr auto cases = std::to_array<CFaultCase>({
        {"X7", noDegree, 0},
        {"", noDegree, 0},
        {"V77", noSign, 1},
        {"vii\xC3\xB8x", noSign, 3},
        {"V7/", noTarget, 3},
        {"V7/x", noTarget, 3},
        {"V/Vx", noSign, 2},
        {"V[no3][ad4]", noGroup, 7},
        {"V[add4][addd4]/V", noGroup, 11},
        {"V[add44]", noGroup, 5},
        {"V[omit3][add]", noGroup, 12},
        {"V[no3", noGroup, 1},
        {"V[no3][add4", noGroup, 6},
        {"V[no3]add4]", noGroup, 10},
        {"I[no1no3no5]", "nothing is left of the chord", 0},
    });
    for (const CFaultCase& row : cases) {
        INFO(std::string(row.mText));
        const CNumeralReading reading = ReadNumeral(row.mText, Key("C major"));
        CHECK(reading.mChord.IsUndef());
        CHECK(reading.mFault == row.mFault);
        CHECK(reading.mFaultOffset == row.mOffset);
    }
}

/// "Dm@1 G@4 |@6": the chords or marks of a text with their columns, then the faults.
std::string Words(const CNumeralsReading& reading) {
    std::string shown;
    for (const CNumeralWord& word : reading.mWords) {
        const std::string name = word.mChord.IsUndef() ? word.mText : WriteChordSymbol(word.mChord);
        shown += fmt::format("{}{}@{}", shown.empty() ? "" : " ", name, word.mColumn);
    }
    for (const CTextFault& fault : reading.mFaults) {
        shown += fmt::format(" {}: {}", fault.mColumn, fault.mText);
    }
    return shown;
}

TEST_CASE("Numerals of one word between hyphens, arrows and commas are told apart") {
    const auto read = [](std::string_view text) { return Words(ReadNumerals(text, Key("C"))); };
    CHECK(read("I-V | vi→IV") == "C@1 G@3 |@5 Am@7 F@10");
    CHECK(read("ii7 – V7, I") == "Dm7@1 G7@7 C@11");
    CHECK(read("V4-3-I ii-7-V7–I") == "Gsus4@1 C@6 Dm7@8 G7@13 C@16");
    CHECK(read("1-5-6-4 2-7 1-4 1-6") == "C@1 G@3 Am@5 F@7 Dm7@9 C@13 F@15 Cm6@17");
    CHECK(read("1-5-b7 1-4-57 6-4") == "C@1 G@3 Bb@5 C@8 F@10 G7@12 Am@15 F@17");
    CHECK(Words(ReadNumerals("1-4-5-2", Key("A minor"))) == "Am@1 Dm@3 Em@5 Bdim@7");
    CHECK(read("I-V–vx-IV I-") ==
          "C@1 G@3 vx@5 F@8 Cm@11 6: this sign behind the degree is not understood");
    CHECK(Words(ReadChordWords("C-G Am->F C-7 C-G-")) ==
          "C@1 G@3 Am@5 F@9 Cm7@11 C-G-@15 15: this is no chord");
    for (const char* text : {"I-V", "- I", "1-5-6-4", "I,"}) {
        CHECK(BeginsWithNumeral(text, Key("C")));
    }
    for (const char* text : {"C-G", "- C", "", "-", ","}) {
        CHECK_FALSE(BeginsWithNumeral(text, Key("C")));
    }
}

TEST_CASE("Whatever bytes are read as a numeral, a fault lies within them") {
    constexpr std::string_view bytes = "IViv#b/o+hd^7652349[]noadGerFrNC-()M \xC3\xB8\xE2\x99\xAF";
    std::uint32_t state = 12345;
    for (int i = 0; i < 20000; ++i) {
        std::string text;
        for (int size = i % 24; size > 0; --size) {
            state = state * 1664525 + 1013904223;
            text += bytes[(state >> 8) % bytes.size()];
        }
        const CNumeralReading reading = ReadNumeral(text, Key("A minor"), kByKey);
        CHECK(reading.mChord.IsUndef() == !reading.mFault.empty());
        if (reading.mFaultOffset > text.size()) FAIL(text);
    }
}

}  // namespace
}  // namespace brindle::test
