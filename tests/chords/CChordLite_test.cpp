// SPDX-License-Identifier: MIT
#include "tests/chords/ChordForms.h"
#include "tests/support/Expected.h"

#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/Trace.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <limits>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

constexpr CKeyEnh kC{0, TEnh_n};
constexpr CKeyEnh kCSharp{1, TEnh_s};
constexpr CKeyEnh kDFlat{1, TEnh_b};
constexpr CKeyEnh kBFlat{10, TEnh_b};

json Skeletons(const json& in) {
    const CChordLite chord(kC, {}, SemitonesOf(in.at(0)));
    return {{"BasicChord", static_cast<int>(chord.BasicChord())},
            {"BasicChordForNaming", static_cast<int>(chord.BasicChordForNaming())},
            {"BasicChordSemitones", chord.BasicChordSemitones().Mask()},
            {"OptionsSemitones", chord.OptionsSemitones().Mask()}};
}

json Comparisons(const json& in) {
    const CChordLite a = ChordLiteOf(in.at(0));
    const CChordLite b = ChordLiteOf(in.at(1));
    return {{"EqualExceptRootAndBass", a.EqualExceptRootAndBass(b)},
            {"EqualWithoutEnh", a.EqualWithoutEnh(b)},
            {"EqualWithoutDir", a.EqualWithoutDir(b)},
            {"EqualIncludingDir", a.EqualIncludingDir(b)},
            {"operator==", a == b},
            {"operator<", a < b}};
}

json Sorted(const json& in) {
    std::vector<CChordLite> chords;
    for (const json& form : in.at(0)) chords.push_back(ChordLiteOf(form));
    std::sort(chords.begin(), chords.end());
    json sorted = json::array();
    for (const CChordLite& chord : chords) sorted.push_back(FormOf(chord));
    return sorted;
}

json Intervals(const CChordLite& chord) {
    return {{"HasIntvlButNotInBassKeyEnhAlone",
             ThoseOf(-24, 24, [&](int i) { return chord.HasIntvlButNotInBassKeyEnhAlone(i); })},
            {"HasBasicChordIntvl",
             ThoseOf(-24, 24, [&](int i) { return chord.HasBasicChordIntvl(i); })},
            {"HasOptionsIntvl", ThoseOf(-24, 24, [&](int i) { return chord.HasOptionsIntvl(i); })}};
}

json RootAndBass(const CChordLite& chord) {
    return {{"HasBassNote", chord.HasBassNote()},
            {"IsSlashChord", chord.IsSlashChord()},
            {"KeyIntvlFromRootToBass", chord.KeyIntvlFromRootToBass()},
            {"AbsKeyIntvlFromRootToBass", chord.AbsKeyIntvlFromRootToBass()},
            {"SmallestKeyIntvlBetweenRootAndBass", chord.SmallestKeyIntvlBetweenRootAndBass()},
            {"KeyDistanceBetweenRootAndBass", chord.KeyDistanceBetweenRootAndBass()},
            {"BassKeyEnhHasIntvlAlone", chord.BassKeyEnhHasIntvlAlone()},
            {"BassKeyEnhHasThisIntvlAlone",
             ThoseOf(-24, 24, [&](int i) { return chord.BassKeyEnhHasThisIntvlAlone(i); })}};
}

/// The file asks for intervals of chords on C without a bass, but for one of these; for all
/// others it asks how root and bass relate.
json Questions(const json& in) {
    const CChordLite chord = ChordLiteOf(in.at(0));
    const bool plainC = chord.mRootKeyEnh == kC && !chord.HasBassNote();
    return plainC && chord.mSemitones != CSemitones(1297) ? Intervals(chord) : RootAndBass(chord);
}

template <class Function>
Answer KeyNrs(Function function) {
    return [function](const json& in) {
        const CChordLite chord = ChordLiteOf(in.at(0));
        json keyNrs = ForEachKeyNr([&](int keyNr) { return function(chord, keyNr); });
        keyNrs.push_back(function(chord, kKeyNrUndef));
        return keyNrs;
    };
}

template <class Function>
Answer Degrees(Function function) {
    return [function](const json& in) {
        const auto type =
            in.at(1) == "minor" ? TSignKeyTypeNoUndef_Minor : TSignKeyTypeNoUndef_Major;
        const CSignKeyHeavy signKey(KeyEnhOf(in.at(0)), type);
        return ForEachKeyNr([&](int keyNr) {
            const CKeyEnh key{keyNr, TEnh_n};
            return function(CChordLite(key, key, CSemitones(145)), signKey);
        });
    };
}

template <class Function>
Answer Quantized(Function function) {
    return [function](const json& in) {
        const CChordLite chord(KeyEnhOf(in.at(0)), {}, SemitonesOf(in.at(1)));
        const auto direction = static_cast<TQuantizeDirection>(in.at(2).get<int>());
        json noteNrs = json::array();
        for (int noteNr = in.at(3); noteNr <= in.at(4); ++noteNr) {
            noteNrs.push_back(function(chord, noteNr, direction));
        }
        return noteNrs;
    };
}

}  // namespace

TEST_CASE("Every set of semitones has its skeleton and options") {
    CheckExpected("chord_basic_chords", {{"CChordLite", Skeletons}});
}

TEST_CASE("A compact chord survives its code and its text, and has one place in the order") {
    CheckExpected(
        "chord_records",
        {
            {"CChordLite", Comparisons},
            {"CChordLite::operator<", Sorted},
            {"CChordLite::GetChordHashCode",
             [](const json& in) { return ChordLiteOf(in.at(0)).GetChordHashCode(); }},
            {"CChordLite::SetFromChordHashCode",
             [](const json& in) {
                 CChordLite chord;
                 chord.SetFromChordHashCode(in.at(0).get<std::int64_t>());
                 return FormOf(chord);
             }},
            {"CChordLite::AppendJSONString",
             [](const json& in) { return JSONStringOf(ChordLiteOf(in.at(0))); }},
            {"CChordLite::FromDictionary",
             [](const json& in) { return FormOf(CChordLite::FromDictionary(in.at(0))); }},
            {"CChordLite::IsUndef", [](const json& in) { return ChordLiteOf(in.at(0)).IsUndef(); }},
            {"CChordLite::IsNoChordYield",
             [](const json& in) { return ChordLiteOf(in.at(0)).IsNoChordYield(); }},
            {"CChordLite::IsNoChordForce",
             [](const json& in) { return ChordLiteOf(in.at(0)).IsNoChordForce(); }},
        });
}

TEST_CASE("A compact chord knows the intervals from its root to its bass and to any key") {
    CheckExpected(
        "chord_root_bass",
        {
            {"CChordLite", Questions},
            {"CChordLite::ChordKeyNrFromKeyNr", KeyNrs([](const CChordLite& chord, int keyNr) {
                 return chord.ChordKeyNrFromKeyNr(keyNr);
             })},
            {"CChordLite::KeyNrFromChordKeyNr", KeyNrs([](const CChordLite& chord, int keyNr) {
                 return chord.KeyNrFromChordKeyNr(keyNr);
             })},
            {"CChordLite::RootNoteDegreeNrInSignKey",
             Degrees([](const CChordLite& chord, const CSignKeyHeavy& signKey) {
                 return chord.RootNoteDegreeNrInSignKey(signKey);
             })},
            {"CChordLite::BassNoteDegreeNrInSignKey",
             Degrees([](const CChordLite& chord, const CSignKeyHeavy& signKey) {
                 return chord.BassNoteDegreeNrInSignKey(signKey);
             })},
        });
}

TEST_CASE("A note moves to the nearest tone of a chord") {
    CheckExpected(
        "chord_quantize",
        {
            {"CChordLite::QuantizeToChord",
             Quantized([](const CChordLite& chord, int noteNr, TQuantizeDirection direction) {
                 return chord.QuantizeToChord(noteNr, direction);
             })},
            {"CChordLite::QuantizeToBasicChord",
             Quantized([](const CChordLite& chord, int noteNr, TQuantizeDirection direction) {
                 return chord.QuantizeToBasicChord(noteNr, direction);
             })},
        });
}

TEST_CASE("Undefined notes and chords are not quantized") {
    const CChordLite chord(kC, {}, CSemitones{0, 4, 7});
    const CChordLite noTones(kC, {}, {});
    const CChordLite undefined;
    for (const auto direction : {TQuantizeDirection_ClosestTieRight, TQuantizeDirection_Left}) {
        CHECK(chord.QuantizeToChord(-1, direction) == -1);
        CHECK(chord.QuantizeToChord(255, direction) == -1);
        CHECK(undefined.QuantizeToChord(255, direction) == 255);
        CHECK(undefined.QuantizeToChord(61, direction) == 61);
        CHECK(noTones.QuantizeToChord(61, direction) == 61);
    }
    // Kept: the octave counted from the root is not left, so the way up from G ends on the A flat
    // below.
    const CChordLite aFlat({8, TEnh_b}, {}, CSemitones{0});
    CHECK(aFlat.QuantizeToChord(67, TQuantizeDirection_Right) == 56);
    for (const auto noteNr :
         {std::numeric_limits<std::int64_t>::max(), std::numeric_limits<std::int64_t>::min()}) {
        CHECK(noTones.QuantizeToChord(noteNr, TQuantizeDirection_Right) == noteNr);
        (void)chord.QuantizeToChord(noteNr, TQuantizeDirection_Right);
        (void)chord.QuantizeToChord(noteNr, TQuantizeDirection_Left);
    }
}

TEST_CASE("A bass of the root's key is a slash chord when it is spelled otherwise") {
    CHECK_FALSE(CChordLite(kC, kC, CSemitones{0, 4, 7}).IsSlashChord());
    const CChordLite enharmonic(kCSharp, kDFlat, CSemitones{0, 4, 7});
    CHECK(enharmonic.IsSlashChord());
    CHECK(enharmonic.KeyIntvlFromRootToBass() == 0);
}

TEST_CASE("Half-diminished chords are named as minor only with their own seventh") {
    const CChordLite halfDiminished(kC, {}, CSemitones{0, 3, 6, 10});
    CHECK(halfDiminished.BasicChord() == TBasicChord::Diminished);
    CHECK(halfDiminished.BasicChordForNaming() == TBasicChord::Minor);
    const CChordLite seventhInBass(kC, kBFlat, CSemitones{0, 3, 6});
    CHECK(seventhInBass.BasicChordForNaming() == TBasicChord::Diminished);
}

TEST_CASE("A compact chord is traced by its name and its fields") {
    CHECK(TraceString(CChordLite(kC, {4, TEnh_n}, CSemitones{0, 4, 7})) ==
          "CChordLite: C/E  RootKeyEnh CKeyEnh(0, TEnh_n), BassKeyEnh CKeyEnh(4, TEnh_n), "
          "Semitones 145");
    CHECK(TraceString(CChordLite(kC, kC, CSemitones{0, 3, 7})) ==
          "CChordLite: Cm  RootKeyEnh CKeyEnh(0, TEnh_n), BassKeyEnh CKeyEnh(0, TEnh_n), "
          "Semitones 137");
    CHECK(TraceString(CChordLite_Undef) ==
          "CChordLite: No Chord  RootKeyEnh CKeyEnh(15, TEnh_Undef), "
          "BassKeyEnh CKeyEnh(15, TEnh_Undef), Semitones 0");
}

TEST_CASE("The hash code tells the three non-chords apart and keeps the directions") {
    CHECK(CChordLite_Undef.GetChordHashCode() == 0x7F7F000000);
    CHECK(CChordLite_NoChordForce.GetChordHashCode() == 0x7F1F000000);
    CHECK(CChordLite_NoChordYield.GetChordHashCode() == 0x7F0F000000);

    CChordLite chord;
    chord.mRootDir = 1;
    chord.mBassDir = 2;
    chord.SetFromChordHashCode(CChordLite(kC, kBFlat, CSemitones{0, 4, 7}).GetChordHashCode());
    CHECK(chord == CChordLite(kC, kBFlat, CSemitones{0, 4, 7}));
    CHECK(chord.mRootDir == 1);
    CHECK(chord.mBassDir == 2);
}

TEST_CASE("A triple flat borrows from the next field of the hash code") {
    const CChordLite chord({11, TEnh_bbb}, {4, TEnh_n}, CSemitones{0, 4, 7});
    CChordLite readBack;
    readBack.SetFromChordHashCode(chord.GetChordHashCode());
    CHECK(static_cast<int>(readBack.mRootKeyEnh.mEnh) == 15);
    CHECK(readBack.mBassKeyEnh.mKeyNr == 3);
    CHECK(readBack.mSemitones == chord.mSemitones);
}

TEST_CASE("Chord dictionaries of wrong types read as if the values were missing") {
    const CChordLite missing({0, TEnh_Undef}, {0, TEnh_Undef}, {});
    const char* const texts[] = {
        "null",
        "[]",
        "3",
        "{}",
        R"({"RootKeyEnh":5,"BassKeyEnh":"x","Semitones":[145]})",
        R"({"RootKeyNr":{},"BassKeyNr":null,"Semitones":{}})",
    };
    for (const char* text : texts) {
        CAPTURE(text);
        CHECK(CChordLite::FromDictionary(json::parse(text)) == missing);
    }
    const auto huge = json::parse(R"({"RootKeyNr":1e300,"BassKeyNr":-2147483648,"Semitones":-1})");
    const CChordLite chord = CChordLite::FromDictionary(huge);
    CHECK(chord.AbsKeyIntvlFromRootToBass() >= 0);
    CHECK(chord.KeyDistanceBetweenRootAndBass() != kIntvlUndef);
    CHECK_FALSE(chord.IsInSignKeyRegardlessOfEnh(CSignKeyLite(kC, TSignKeyType_Major)));
}
