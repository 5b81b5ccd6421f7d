// SPDX-License-Identifier: MIT
#include "tests/chords/ChordForms.h"
#include "tests/support/Expected.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

CChordLite ChordOf(const json& in) {
    return {KeyEnhOf(in.at(0)), {}, SemitonesOf(in.at(1))};
}

/// What `answer` gives for the twelve major and the twelve minor keys.
template <class Answer>
json ForEachSignKey(Answer answer) {
    const auto ofType = [&](TSignKeyTypeNoUndef type) {
        return ForEachKeyNr([&](int keyNr) { return answer(CSignKeyHeavy(keyNr, type)); });
    };
    return {{"major", ofType(TSignKeyTypeNoUndef_Major)},
            {"minor", ofType(TSignKeyTypeNoUndef_Minor)}};
}

/// The keys to which the chord belongs.
template <class Chord>
json KeysOf(const Chord& chord) {
    const auto ofType = [&](TSignKeyTypeNoUndef type) {
        return ThoseOf(0, 11, [&](int keyNr) {
            return chord.IsInSignKeyRegardlessOfEnh(CSignKeyHeavy(keyNr, type));
        });
    };
    return {{"major", ofType(TSignKeyTypeNoUndef_Major)},
            {"minor", ofType(TSignKeyTypeNoUndef_Minor)}};
}

const CSignKeyHeavy kCMajor(0, TSignKeyTypeNoUndef_Major);
const CSignKeyHeavy kAMinor(9, TSignKeyTypeNoUndef_Minor);

}  // namespace

TEST_CASE("A chord belongs to the keys that hold its tones, and is closest where it is at home") {
    CheckExpected("chord_in_sign_key",
                  {
                      {"CChordLite::IsInSignKeyRegardlessOfEnh",
                       [](const json& in) { return KeysOf(ChordOf(in)); }},
                      {"CChordHeavy::IsInSignKeyRegardlessOfEnh",
                       [](const json& in) { return KeysOf(ChordOf(in).ToChordHeavy(24)); }},
                      {"CChordHeavy::ClosenessToSignKey",
                       [](const json& in) {
                           const CChordHeavy chord = ChordOf(in).ToChordHeavy(24);
                           return ForEachSignKey([&](const CSignKeyHeavy& signKey) {
                               return chord.ClosenessToSignKey(signKey);
                           });
                       }},
                      {"CChordHeavy::CountIntvlsInSignKey",
                       [](const json& in) {
                           const CChordHeavy chord = ChordOf(in).ToChordHeavy(24);
                           return ForEachSignKey([&](const CSignKeyHeavy& signKey) {
                               return chord.CountIntvlsInSignKey(signKey);
                           });
                       }},
                  });
}

TEST_CASE("On the fifth degree of a minor key only a major third counts") {
    const CKeyEnh e{4, TEnh_n};
    CHECK(CChordHeavy(e, TBasicChord::Major, {}).IsInSignKeyRegardlessOfEnh(kAMinor));
    CHECK_FALSE(CChordHeavy(e, TBasicChord::Minor, {}).IsInSignKeyRegardlessOfEnh(kAMinor));
    CHECK(CChordHeavy(e, TBasicChord::Minor, {}).IsInSignKeyRegardlessOfEnh(kCMajor));
    CHECK_FALSE(CChordHeavy(e, TBasicChord::Major, {}).IsInSignKeyRegardlessOfEnh(kCMajor));
    // With root and bass in octave -1 a bass below the root stands at 4 + 12.
    const CChordHeavy fifthsOverThird(CKeyEnh{9, TEnh_n}, CSemitones{0, 7}, CKeyEnh{1, TEnh_s});
    const CSignKeyHeavy dMinor(2, TSignKeyTypeNoUndef_Minor);
    CHECK(fifthsOverThird.HasIntvl(16));
    CHECK_FALSE(fifthsOverThird.IsInSignKeyRegardlessOfEnh(dMinor));
}

TEST_CASE("Three shapes belong to a key by their root alone") {
    const CKeyEnh a{9, TEnh_n};
    for (const CSemitones shape :
         {CSemitones{0, 4, 7}, CSemitones{0, 4, 8}, CSemitones{0, 4, 7, 10}}) {
        CHECK(CChordLite(a, {}, shape).IsInSignKeyRegardlessOfEnh(kCMajor));
    }
    CHECK_FALSE(CChordLite(a, {}, CSemitones{0, 4, 7, 11}).IsInSignKeyRegardlessOfEnh(kCMajor));
    CHECK_FALSE(CChordLite(a, {}, CSemitones{0}).IsInSignKeyRegardlessOfEnh(kCMajor));
}

TEST_CASE("A sign key without a type counts as major, one without a root holds no chord") {
    const CChordLite em({4, TEnh_n}, {}, CSemitones{0, 3, 7});
    const CKeyEnh c{0, TEnh_n};
    CHECK(em.IsInSignKeyRegardlessOfEnh(CSignKeyLite(c, TSignKeyType_Undef)));
    CHECK_FALSE(em.IsInSignKeyRegardlessOfEnh(CSignKeyLite({}, TSignKeyType_Major)));
    CHECK_FALSE(em.IsInSignKeyRegardlessOfEnh(CSignKeyHeavy_Undef));
    CHECK(em.RootNoteDegreeNrInSignKey(CSignKeyHeavy_Undef) == -1);
    CHECK(CChordLite_Undef.RootNoteDegreeNrInSignKey(kCMajor) == -1);
    CHECK_FALSE(CChordLite_Undef.IsInSignKeyRegardlessOfEnh(kCMajor));
}
