// SPDX-License-Identifier: MIT
#include "brindle/analysis/ReadHarmony.h"
#include "RandomChordTexts.h"
#include "ReadingForms.h"

#include "brindle/analysis/RomanNumeral.h"
#include "brindle/theory/KeyIntervals.h"

#include <doctest/doctest.h>

#include <limits>
#include <vector>

namespace brindle::test {
namespace {

CChordReading Moved(CChordReading reading, int up) {
    if (!reading.mKey.IsUndef()) {
        reading.mKey.mRootKeyEnh = {FoldIntoOctave(reading.mKey.mRootKeyEnh.mKeyNr + up),
                                    TEnh_Undef};
    }
    return reading;
}

// docs/reading.md has these.
TEST_CASE("Each relation is told from its neighbours") {
    struct CCase {
        const char* mText;
        std::size_t mIx;
        const char* mRead;
    };
    constexpr auto cases = std::to_array<CCase>({
        {"C | F | G7 | C", 2, "V7 D dominant 3"},
        {"C | A7 | Dm7 G7 | C", 1, "V7/ii D dominant 2"},
        {"C | F | C/G G7 | C", 2, "I D dominant 3"},
        {"C | Dm7 G7 | C", 1, "ii7 S related second 2"},
        {"C | Em7b5 A7 | Dm7 G7 | C", 1, "iih7/ii S related second 2"},
        {"C | Dm7 | Db7 | C", 2, "subV7/I D substitute dominant 3"},
        {"C | F | Bo7 | C", 2, "viio7 D leading diminished 3"},
        {"C | F#o7 | G7 | C", 1, "viio7/V D leading diminished 2"},
        {"Cmaj7 | Em7 Ebo7 | Dm7 G7 | Cmaj7", 2, "biiio7 - passing diminished 3"},
        {"C | Co7 | C | G7 | C", 1, "io7 - common-tone diminished 2"},
        {"Cmaj7 | Fm7 Bb7 | Cmaj7 | G7 | C", 1, "iv7 S backdoor 2"},
        {"Cmaj7 | Fm7 Bb7 | Cmaj7 | G7 | C", 2, "bVII7 D backdoor 3"},
        {"C | G | F | C", 2, "IV S plagal 3"},
        {"C | F | Fm | C", 2, "iv S borrowed 3"},
        {"C | E | F | Fm | C", 1, "III T chromatic mediant -1"},
        {"C | F | Db/F | G7 | C", 2, "N6 S Neapolitan 3"},
        {"C | F | Ab7 | G | C", 2, "Ger6 S augmented sixth 3"},
        {"C7 | F7 | C7 | G7 | C7", 0, "I7 T blues -1"},
        {"C7 | F7 | C7 | G7 | C7", 1, "IV7 S blues 2"},
        {"Am | Am^7 | Am7 | Am6 | Dm | E7 | Am", 1, "i^7 T line cliche -1"},
        {"C | F | G7 | Am | F | G7 | C", 2, "V7 D dominant! 3"},
    });
    for (const CCase& row : cases) {
        INFO(row.mText);
        const CSongReading song = ReadHarmony(BarsOf(row.mText));
        const CChordReading& chord = song.mChords[row.mIx];
        CHECK(chord.mNumeral + ' ' + std::string(LetterOf(chord.mFunction)) + ' ' +
                  std::string(NameOf(chord.mRelation)) + (chord.mDeceptive ? "! " : " ") +
                  std::to_string(chord.mResolvesTo) ==
              row.mRead);
    }
}

TEST_CASE("A song in another key is read the same there") {
    for (std::uint32_t seed = 1; seed <= 60; ++seed) {
        CChance chance(seed);
        const CHarmAnlsChords song = RandomChords(chance, 1 + chance.Below(60));
        const CSongReading reading = ReadHarmony(song);
        for (int up = 1; up < 12; ++up) {
            CAPTURE(seed);
            CAPTURE(up);
            const CHarmAnlsChords other = Transposed(song, up);
            const CSongReading otherReading = ReadHarmony(other);
            REQUIRE(otherReading.mChords.size() == song.size());
            for (std::size_t i = 0; i < song.size(); ++i) {
                CHECK(Moved(otherReading.mChords[i], 0) == Moved(reading.mChords[i], up));
            }
        }
    }
}

TEST_CASE("Each chord points to a later one that exists, no two arcs cross, and regions hold it") {
    for (std::uint32_t seed = 1; seed <= 200; ++seed) {
        CAPTURE(seed);
        CChance chance(seed);
        const CHarmAnlsChords song = RandomChords(chance, chance.Below(80));
        const CSongReading reading = ReadHarmony(song);
        REQUIRE(reading.mChords.size() == song.size());
        std::vector<std::ptrdiff_t> arcs;
        for (std::size_t i = 0; i < song.size(); ++i) {
            const auto ix = static_cast<std::ptrdiff_t>(i);
            const CChordReading& chord = reading.mChords[i];
            CHECK(chord.mKey.IsUndef() == song[i].IsUndef());
            CHECK(chord.mNumeral.empty() == song[i].IsUndef());
            CHECK((chord.mRelation == TChordRelation_Undef) == song[i].IsUndef());
            for (const std::ptrdiff_t to : {chord.mResolvesTo, chord.mUnder}) {
                if (to < 0) continue;
                REQUIRE(to < static_cast<std::ptrdiff_t>(song.size()));
                CHECK_FALSE(song[static_cast<std::size_t>(to)].IsUndef());
            }
            while (!arcs.empty() && arcs.back() <= ix) arcs.pop_back();
            const bool isAgain = i > 0 && chord == reading.mChords[i - 1];
            if (chord.mUnder < 0 || isAgain) continue;
            CHECK(chord.mUnder > ix);
            CHECK((arcs.empty() || chord.mUnder <= arcs.back()));
            arcs.push_back(chord.mUnder);
        }
        for (const CKeyRegion& region : reading.mRegions) {
            for (std::size_t i = region.mBegin; i < region.mEnd; ++i) {
                if (!song[i].IsUndef()) CHECK(reading.mChords[i].mKey == region.mKey);
            }
        }
    }
}

TEST_CASE("What is written again or as no chord keeps the places in the list") {
    const CSongReading plain = ReadHarmony(BarsOf("Dm7 | G7 | C"));
    const CSongReading again = ReadHarmony(BarsOf("NC | Dm7 Dm7 | G7 NC | NC | C C"));
    CHECK(ReadingText(plain) == "C: ii7~related second>1 V7~dominant>2 I~tonic");
    CHECK(ReadingText(again) ==
          "C: ii7~related second>3 ii7~related second>3 V7~dominant>6 I~tonic I~tonic");
    CHECK(again.mChords[0] == CChordReading{});
    CHECK(again.mChords[4] == CChordReading{});
    CHarmAnlsChords unclosed = BarsOf("C C");
    unclosed.pop_back();
    CHECK(ReadingText(ReadHarmony(unclosed)) == "C: I~tonic I~tonic");
    REQUIRE(again.mRegions.size() == 1);
    CHECK(again.mRegions[0].mBegin == 1);
    CHECK(again.mRegions[0].mEnd == 8);
}

TEST_CASE("A song twice in a row is read as once, apart from the joint") {
    const CSongReading once = ReadHarmony(BarsOf("C A7 | Dm7 G7 | C F | C"));
    const CSongReading twice =
        ReadHarmony(BarsOf("C A7 | Dm7 G7 | C F | C | G7 | C A7 | Dm7 G7 | C F | C"));
    for (std::size_t i = 0; i < 6; ++i) {
        CAPTURE(i);
        CHECK(twice.mChords[i].mNumeral == once.mChords[i].mNumeral);
        CHECK(twice.mChords[i + 8].mNumeral == once.mChords[i].mNumeral);
        CHECK(twice.mChords[i + 8].mRelation == once.mChords[i].mRelation);
    }
}

TEST_CASE("A stated key is home, and its share tells whether the chords show it") {
    const CHarmAnlsChords chords = BarsOf("Am | F | C | G");
    const CSignKeyLite aMinor({9, TEnh_n}, TSignKeyType_Minor);
    CHECK(ShortKey(ReadHarmony(chords).mKey) == "C");
    const CSongReading stated = ReadHarmony(chords, {.mStatedKey = aMinor});
    CHECK(stated.mKey == aMinor);
    CHECK(ReadHarmony(BarsOf("Am | F | E7 | Am"), {.mStatedKey = aMinor}).mConfidence > 0.9);
    const CSignKeyLite fSharp({6, TEnh_s}, TSignKeyType_Major);
    CHECK(ReadHarmony(chords, {.mStatedKey = fSharp}).mConfidence < 0.01);
    // It keeps its spelling where the chords have another one.
    const CSignKeyLite gFlat({6, TEnh_b}, TSignKeyType_Major);
    const CSongReading flat = ReadHarmony(BarsOf("F# | B | C#7 | F#"), {.mStatedKey = gFlat});
    CHECK(flat.mKey == gFlat);
    CHECK(flat.mRegions.front().mKey == gFlat);
    CHECK(flat.mChords.front().mKey == gFlat);
    // A vamp of ii and V is one of i and IV, unless its key is stated.
    const CHarmAnlsChords vamp = BarsOf("Dm7 | G7 | Dm7 | G7");
    const CSignKeyLite cMajor({0, TEnh_n}, TSignKeyType_Major);
    CHECK(ShortKey(ReadHarmony(vamp).mKey) == "d");
    CHECK(ReadHarmony(vamp, {.mStatedKey = cMajor}).mChords[1].mNumeral == "V7");
}

TEST_CASE("Of two keys with equal scores the lower one is that of the song") {
    // 3.475 points for D and for F major.
    const CChordLite d{{2, TEnh_n}, CKeyEnh_Undef, CSemitones(2039)};
    const CChordLite c{{0, TEnh_n}, CKeyEnh_Undef, CSemitones(1494)};
    const CChordLite gFlat{{6, TEnh_b}, {10, TEnh_b}, CSemitones(2641)};
    CHarmAnlsChords chords;
    chords.emplace_back(d, 0.0);
    chords.emplace_back(c, 8.0);
    chords.emplace_back(gFlat, 24.0);
    chords.emplace_back(CChordLite_Undef, 32.0);
    const CSongReading reading = ReadHarmony(chords);
    CHECK(ShortKey(reading.mKey) == "D");
    CHECK(reading.mChords.front().mUnder == 2);
}

TEST_CASE("The letters of a seventh tell an augmented sixth") {
    struct CCase {
        CKeyEnh mRoot;
        CKeyEnh mSeventh;
        TSeventhSpelling mSpelling;
    };
    constexpr auto cases = std::to_array<CCase>({
        {{0, TEnh_n}, {10, TEnh_b}, TSeventhSpelling_MinorSeventh},    // C Bb
        {{0, TEnh_n}, {10, TEnh_s}, TSeventhSpelling_AugmentedSixth},  // C A#
        {{8, TEnh_b}, {6, TEnh_b}, TSeventhSpelling_MinorSeventh},     // Ab Gb
        {{8, TEnh_b}, {6, TEnh_s}, TSeventhSpelling_AugmentedSixth},   // Ab F#
        {{8, TEnh_s}, {6, TEnh_s}, TSeventhSpelling_MinorSeventh},     // G# F#
        {{5, TEnh_n}, {3, TEnh_s}, TSeventhSpelling_AugmentedSixth},   // F D#
        {{11, TEnh_b}, {9, TEnh_n}, TSeventhSpelling_AugmentedSixth},  // Cb A
        {{0, TEnh_n}, {9, TEnh_n}, TSeventhSpelling_Undef},            // C A
        {{0, TEnh_n}, {10, TEnh_Undef}, TSeventhSpelling_Undef},
    });
    for (const CCase& row : cases) {
        CAPTURE(row.mRoot.mKeyNr);
        CAPTURE(row.mSeventh.mKeyNr);
        CHECK(SeventhSpellingOf(row.mRoot, row.mSeventh) == row.mSpelling);
    }
}

TEST_CASE("A seventh chord written with an augmented sixth is a German sixth, also in jazz") {
    using TSevenths = std::vector<TSeventhSpelling>;
    constexpr TSeventhSpelling none = TSeventhSpelling_Undef;
    constexpr TSeventhSpelling sixth = TSeventhSpelling_AugmentedSixth;
    constexpr TSeventhSpelling seventh = TSeventhSpelling_MinorSeventh;
    const auto numeral = [](std::string_view text, const TSevenths& sevenths, std::size_t ix) {
        const CSongReading reading = ReadHarmony(BarsOf(text), {.mSevenths = sevenths});
        return reading.mChords[ix].mNumeral + " " +
               std::string(NameOf(reading.mChords[ix].mRelation));
    };
    // C7 with A# before B, in E.
    CHECK(numeral("Em7 | Am7 | C7 | B7 | Em7", {}, 2) == "subV7/V substitute dominant");
    CHECK(numeral("Em7 | Am7 | C7 | B7 | Em7", {none, none, sixth}, 2) == "Ger6 augmented sixth");
    CHECK(numeral("Cm | Fm | Ab7 | G | Cm", {}, 2) == "Ger6 augmented sixth");
    CHECK(numeral("Cm | Fm | Ab7 | G | Cm", {none, none, seventh}, 2) ==
          "subV7/V substitute dominant");
    CHECK(numeral("C | F | Eb7 | D7 | G7 | C", {none, none, sixth}, 2) == "Ger6/V augmented sixth");
    // It is told the second time that the chord is written.
    CHECK(numeral("Em7 | Am7 | C7 | C7 | B7 | Em7", {none, none, none, sixth}, 2) ==
          "Ger6 augmented sixth");
    // The bass has letters of its own.
    CHECK(numeral("Em7 | Am7 | C7/A# | B7 | Em7", {}, 2) == "Ger6 augmented sixth");
    CHECK(numeral("Em7 | Am7 | C7/Bb | B7 | Em7", {}, 2) == "subV7/V substitute dominant");
    // It does not lead down a semitone here.
    CHECK(numeral("C | C7 | F | G7 | C", {none, sixth}, 1) == "V7/IV dominant");
}

constexpr auto kStyles = std::to_array<CNumeralOptions>({
    {.mFigures = true},
    {.mByKey = true},
    {.mFigures = true, .mByKey = true},
});

TEST_CASE("Other signs for numerals do not change what was read") {
    struct CRow {
        const char* mSong;
        const char* mFigures;
        const char* mByKey;
        const char* mPrintedSigns;
    };
    const CRow rows[] = {
        {"C7 | F7 | C7 | C7 | F7 | F7 | C7 | C7 | G7 | F7 | C7 | G7",
         "I7 IV7 I7 I7 IV7 IV7 I7 I7 V7 IV7 I7 V7",
         "Id7 IVd7 Id7 Id7 IVd7 IVd7 Id7 Id7 V7 IVd7 Id7 V7",
         "I7 IV7 I7 I7 IV7 IV7 I7 I7 V7 IV7 I7 V7"},
        {"Dm7 | Db7 | Cmaj7", "ii7 subV7/I I^7", "ii7 subV7/I I^7", "ii7 subV7/I I^7"},
        {"C | A7/C# | Dm | G7/B | C", "I V65/ii ii V65 I", "I V7/ii/^#1 ii V7/^7 I",
         "I V7/ii ii V7 I"},
        {"C | Ab7no5 | G | C", "I It6 V I", "I It6 V I", "I It6 V I"},
        {"C | F | C#o7/E | Dm | Em7b5 | A7b9 | Dm | G7 | Bo | C",
         "I IV viio65/ii ii iih7/ii V7b9/ii ii V7 viio I",
         "I IV viio7/ii/^3 ii iih7/ii V7b9/ii ii V7 viio I",
         "I IV vii\xC2\xB0"
         "7/ii ii ii\xC3\xB8"
         "7/ii V7/ii ii V7 vii\xC2\xB0 I"},
    };
    for (const CRow& row : rows) {
        INFO(std::string(row.mSong));
        const CHarmAnlsChords song = BarsOf(row.mSong);
        const auto numerals = [&](const CNumeralOptions& options) {
            std::string text;
            for (const auto& chord : WithNumerals(ReadHarmony(song), song, options).mChords) {
                if (!chord.mNumeral.empty()) text += (text.empty() ? "" : " ") + chord.mNumeral;
            }
            return text;
        };
        CHECK(numerals({.mFigures = true}) == row.mFigures);
        CHECK(numerals({.mByKey = true}) == row.mByKey);
        CHECK(numerals({.mPrintedSigns = true}) == row.mPrintedSigns);
    }
}

TEST_CASE("A numeral in another style sounds as its chord, applied to the same degree") {
    CChance chance(15);
    for (int round = 0; round < 40; ++round) {
        const CHarmAnlsChords song = RandomChords(chance, 60);
        const CSongReading reading = ReadHarmony(song);
        for (const CNumeralOptions& options : kStyles) {
            const CSongReading styled = WithNumerals(reading, song, options);
            for (std::size_t i = 0; i < song.size(); ++i) {
                const std::string& numeral = styled.mChords[i].mNumeral;
                const std::string& plain = reading.mChords[i].mNumeral;
                const bool isName = plain.find_first_of("NGtr") != std::string::npos;
                if (isName) CHECK(numeral == plain);
                if (isName || plain.empty()) continue;
                INFO(plain << " as " << numeral);
                const CNumeralReading read = ReadNumeral(numeral, reading.mChords[i].mKey, options);
                REQUIRE(!read.mChord.IsUndef());
                CHECK(read.mChord.mSemitones == song[i].mSemitones);
                // Each tone of a diminished seventh chord can be its root.
                const int apart =
                    FoldIntoOctave(read.mChord.mRootKeyEnh.mKeyNr) - song[i].mRootKeyEnh.mKeyNr;
                CHECK(apart % (song[i].mSemitones.Mask() == 0x249 ? 3 : 12) == 0);
                const auto bassOf = [](const CChordLite& chord) {
                    const bool hasBass = chord.HasBassNote();
                    return FoldIntoOctave((hasBass ? chord.mBassKeyEnh : chord.mRootKeyEnh).mKeyNr);
                };
                const bool tellsBass = options.mFigures || song[i].HasBassNote();
                if (tellsBass) CHECK(bassOf(read.mChord) == bassOf(song[i]));
                const bool isApplied = plain.find('/') != std::string::npos;
                CHECK(isApplied ==
                      (numeral.find_first_of("iIvV", numeral.find('/')) < numeral.size()));
            }
        }
    }
}

TEST_CASE("No chords, one chord and very many are read") {
    CHECK(ReadHarmony({}).mKey.IsUndef());
    CHECK(ReadHarmony({}).mChords.empty());
    CHECK(ReadHarmony(BarsOf("NC | NC")).mChords.size() == 3);
    CHECK(ReadHarmony(BarsOf("NC | NC")).mConfidence == kPosUndef);
    CHECK(ReadingText(ReadHarmony(BarsOf("Ebm"))) == "eb: i~tonic");
    CChance chance(1);
    const CHarmAnlsChords song = RandomChords(chance, 100000);
    const CSongReading reading = ReadHarmony(song);
    CHECK(reading.mChords.size() == song.size());
    CHECK(reading.mRegions.back().mEnd + 1 == song.size());
}

TEST_CASE("Broken positions, chords, spellings and options are survived") {
    constexpr double nan = std::numeric_limits<double>::quiet_NaN();
    constexpr double infinity = std::numeric_limits<double>::infinity();
    const CChordLite c{CKeyEnh_C, CKeyEnh_Undef, CSemitones{0, 4, 7}};
    const CChordLite g7{CKeyEnh_G, CKeyEnh_Undef, CSemitones{0, 4, 7, 10}};
    const CChordLite odd{{-1234567890, static_cast<TEnh>(99)},
                         {2147483647, static_cast<TEnh>(-99)},
                         CSemitones(~std::uint64_t{0})};
    const std::vector<TSeventhSpelling> sevenths(99, static_cast<TSeventhSpelling>(77));
    for (const double first : {nan, infinity, -infinity, -1.0, 1e300, kPosUndef, 1e-320}) {
        for (const double second : {nan, infinity, -infinity, -1.0, 1e300, kPosUndef}) {
            CHarmAnlsChords chords;
            for (const CChordLite& chord : {c, g7}) chords.emplace_back(chord, first);
            for (const CChordLite& chord : {odd, c}) chords.emplace_back(chord, second);
            const CSongReading reading =
                ReadHarmony(chords, {.mKeys = {first, second, first},
                                     .mStatedKey = {{-77, TEnh_sss}, static_cast<TSignKeyType>(9)},
                                     .mSevenths = sevenths});
            for (const CChordReading& chord : reading.mChords) {
                CHECK_FALSE(chord.mNumeral.empty());
                CHECK_FALSE(NameOf(chord.mRelation).empty());
                CHECK_FALSE(NameOf(chord.mFunction).empty());
            }
        }
    }
}

}  // namespace
}  // namespace brindle::test
