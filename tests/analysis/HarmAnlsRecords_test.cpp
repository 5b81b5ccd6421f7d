// SPDX-License-Identifier: MIT
#include "tests/analysis/AnalysisForms.h"

#include "brindle/analysis/CHarmAnlsSignKeys.h"

#include <doctest/doctest.h>

#include <iomanip>
#include <limits>
#include <locale>

using namespace brindle;
using namespace brindle::test;

namespace {

constexpr CKeyEnh kC{0, TEnh_n};
constexpr CKeyEnh kE{4, TEnh_n};
constexpr CKeyEnh kCSharp{1, TEnh_s};
constexpr CKeyEnh kDFlat{1, TEnh_b};
constexpr CSemitones kTriad{145};

CHarmAnlsChordWithPos ChordAt(double position, CKeyEnh root, CKeyEnh bass = CKeyEnh_Undef) {
    return CHarmAnlsChordWithPos(CChordLite(root, bass, kTriad), position);
}

CHarmAnlsChordWithPos EndMarkerAt(double position) {
    return CHarmAnlsChordWithPos(CChordLite_Undef, position);
}

/// A decimal comma, and points between the thousands.
class CCommaNumbers : public std::numpunct<char> {
    char do_decimal_point() const override { return ','; }
    char do_thousands_sep() const override { return '.'; }
    std::string do_grouping() const override { return "\3"; }
};

CHarmAnlsSignKeys OneSignKey() {
    CHarmAnlsSignKeys signKeys(1);
    signKeys[0].mSignKey = {kC, TSignKeyType_Major};
    CHarmAnlsCenter& center = signKeys[0].mHarmCenters.emplace_back();
    center.mProbability = 0.5;
    center.mPosition = 1234.567;
    center.mHarmCenter = {kC, kSemitonesMajor};
    center.mChords = {ChordAt(1234.567, kE, kC), EndMarkerAt(1235.0)};
    center.mChords[0].mSemitones = kSemitonesMajor;
    center.AnalyseHarmFunctionsOfChords();
    return signKeys;
}

}  // namespace

TEST_CASE("A chord list knows its end, its last chord and its different chords") {
    CHECK(CHarmAnlsChords().LastChordEndPos() == kPosUndef);
    const CHarmAnlsChords silence{EndMarkerAt(3.0)};
    CHECK(silence.LastChordEndPos() == 4.0);
    CHECK(silence.LastNonUndefChord() == silence.end());

    const CHarmAnlsChords chords{ChordAt(0.0, kC),      ChordAt(1.0, kC, kE), ChordAt(2.0, kC),
                                 ChordAt(3.0, kCSharp), ChordAt(4.0, kDFlat), EndMarkerAt(5.0)};
    CHECK(chords.LastNonUndefChord() - chords.begin() == 4);
    CHECK(chords.CountDifferentNonUndefChords() == 4);
    // D flat is the smaller spelling and sorts behind C sharp.
    CHECK(chords.CreateSetOfNonUndefChords().rbegin()->mRootKeyEnh == kDFlat);
}

TEST_CASE("Chords go into a list at their place, behind those of the same position") {
    CHarmAnlsChords chords{ChordAt(0.0, kC), ChordAt(2.0, kC), ChordAt(4.0, kC)};
    const CHarmAnlsChords added{ChordAt(2.0, kE), ChordAt(1.0, kE), ChordAt(9.0, kE)};
    chords.InsertAtCorrectPosition(added.begin(), added.end());
    chords.InsertAtCorrectPosition(added.end(), added.end());
    CHECK(chords == CHarmAnlsChords{ChordAt(0.0, kC), ChordAt(1.0, kE), ChordAt(2.0, kC),
                                    ChordAt(2.0, kE), ChordAt(4.0, kC), ChordAt(9.0, kE)});

    const CHarmAnlsChords nowhere{ChordAt(std::numeric_limits<double>::quiet_NaN(), kE)};
    chords.InsertAtCorrectPosition(chords.begin(), nowhere.begin(), nowhere.end());
    CHECK(chords.front() == ChordAt(0.0, kC));
    CHECK(chords.back().mRootKeyEnh == kE);
}

TEST_CASE("Each chord comparison leaves out what its name says") {
    const CHarmAnlsChord cSharp(CChordLite(kCSharp, kE, kTriad), 1, 4);
    CHarmAnlsChord other = cSharp;
    other.mRootDir = 1;
    CHECK(cSharp == other);
    other.mRootKeyEnh = kDFlat;
    CHECK_FALSE(cSharp == other);
    CHECK(cSharp.EqualWithoutEnh(other));
    other.mRootKeyEnh = kC;
    CHECK_FALSE(cSharp.EqualWithoutEnh(other));
    CHECK(cSharp.EqualExceptRootAndBass(other));
    other.mBassDistToHarmCenter = -1;
    CHECK_FALSE(cSharp.EqualExceptRootAndBass(other));
    other = cSharp;
    other.mRootDistToHarmCenter = 7;
    CHECK_FALSE(cSharp == other);
    CHECK_FALSE(cSharp < other);
    CHECK_FALSE(ChordAt(0.0, kC) == ChordAt(1.0, kC));
}

TEST_CASE("The function of a chord is its distance above the center, and nothing without a root") {
    CHarmAnlsCenter center;
    center.mChords = {ChordAt(0.0, kC, kE), ChordAt(1.0, kC), ChordAt(2.0, CKeyEnh_Undef, kE),
                      ChordAt(3.0, {std::numeric_limits<int>::min(), TEnh_n})};
    center.AnalyseHarmFunctionsOfChords();
    CHECK(center.mChords[0].mRootDistToHarmCenter == -1);

    center.mHarmCenter = {{9, TEnh_n}, kSemitonesNaturalMinor};
    center.AnalyseHarmFunctionsOfChords();
    constexpr std::pair<int, int> expected[] = {{3, 7}, {3, -1}, {-1, -1}, {7, -1}};
    for (std::size_t i = 0; i < 4; ++i) {
        CHECK(center.mChords[i].mRootDistToHarmCenter == expected[i].first);
        CHECK(center.mChords[i].mBassDistToHarmCenter == expected[i].second);
    }
}

TEST_CASE("An undefined center takes key and mode from its sign key, and the other way round") {
    struct CCase {
        TSignKeyType mType;
        CSemitones mMask;
    };
    for (const auto& [type, mask] :
         {CCase{TSignKeyType_Major, kSemitonesMajor},
          CCase{TSignKeyType_Minor, kSemitonesNaturalMinor}, CCase{TSignKeyType_Undef, {}}}) {
        CHarmAnlsSignKey signKey;
        signKey.mSignKey = {kDFlat, type};
        signKey.mPosition = 2.0;
        CHarmAnlsCenter center;
        center.IfUndefFillWithHarmSignKey(signKey);
        CHECK(center.mHarmCenter == CHarmCenterLite(kDFlat, mask));
        CHECK(center.mPosition == 2.0);

        CHarmAnlsSignKey filled;
        filled.mPosition = 7.0;
        filled.IfUndefFillWithHarmAnlsCenter(center);
        CHECK(filled.mSignKey == signKey.mSignKey);
        CHECK(filled.mPosition == 7.0);
        center.mHarmCenter.mRootKeyEnh = kE;
        filled.IfUndefFillWithHarmAnlsCenter(center);
        CHECK((filled.mSignKey == signKey.mSignKey) == (type != TSignKeyType_Undef));
    }
}

TEST_CASE("Sign keys of the same key join and keep their centers in order") {
    CHarmAnlsSignKeys signKeys;
    for (const CKeyEnh key : {kC, kC, kE, kC, kC, kC}) {
        CHarmAnlsSignKey& signKey = signKeys.emplace_back();
        signKey.mSignKey = {key, TSignKeyType_Major};
        signKey.mHarmCenters.emplace_back().mPosition = static_cast<double>(signKeys.size());
    }
    signKeys.MergeAdjacentSameSignKeys();
    REQUIRE(signKeys.size() == 3);
    CHECK(signKeys[0].mHarmCenters.size() == 2);
    CHECK(signKeys[2].mHarmCenters.size() == 3);
    CHECK(signKeys[2].mHarmCenters[2].mPosition == 6.0);
    CHECK(signKeys._MergeSignKeysAndEraseSecond(signKeys.begin(), signKeys.begin() + 1) ==
          signKeys.begin() + 1);
    CHECK(signKeys[0].mHarmCenters.back().mPosition == 3.0);
}

TEST_CASE("The JSON text does not depend on the state of the stream, nor change it") {
    const CHarmAnlsSignKeys signKeys = OneSignKey();
    const std::string plain = JSONStringOf(signKeys);
    CHECK(plain.find(R"("Probability":  0.50, "Position":1234.57, "HarmCenter")") != plain.npos);
    CHECK(plain.find(R"("Semitones":2741, "RootDistToHarmCenter": 4, )") != plain.npos);

    std::ostringstream stream;
    stream.imbue(std::locale(std::locale::classic(), new CCommaNumbers));
    stream << std::setw(12) << std::setfill('*') << std::hex << std::showbase << std::showpos
           << std::left << std::scientific << std::setprecision(9);
    const std::ios::fmtflags flags = stream.flags();
    signKeys.AppendJSONString(stream);
    CHECK(stream.str() == plain);
    CHECK(stream.flags() == flags);
    CHECK(stream.precision() == 9);
    CHECK(stream.fill() == '*');
}
