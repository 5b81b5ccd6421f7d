// SPDX-License-Identifier: MIT
#include "tests/support/Forms.h"

#include "brindle/analysis/CHarmAnls.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

TEST_CASE("Chords are read from dictionaries, and what is of the wrong kind counts as missing") {
    const CHarmAnlsChordWithLength seventh(
        CHarmAnlsChord(CChordLite({1, TEnh_s}, {4, TEnh_n}, CSemitones(1169)), 7, 10), 3.5);
    const json whole = json::parse(JSONStringOf(seventh));
    using THelper = CHarmAnlsChordWithLength::JSONDeserializer_Helper;
    CHECK(THelper::CHarmAnlsChordWithLengthFromJSONDictionary(whole) == seventh);
    CHECK(CHarmAnls::Chord::FromDictionary(whole) == seventh);
    CHECK(CHarmAnls::ChordWithPos::FromDictionary(whole).mPosition == kPosUndef);
    CHECK(CHarmAnls::ChordWithLength::FromDictionary(whole).mLength == 3.5);
    CHECK(CHarmAnls::ChordWithLength::FromDictionary(whole).mRootDistToHarmCenter == -1);

    for (const json& wrong : {json(), json(true), json::array({7}), json::object()}) {
        json dictionary = whole;
        dictionary["RootDistToHarmCenter"] = wrong;
        dictionary["Length"] = wrong;
        dictionary["Position"] = dictionary["Length"];
        const auto chord = THelper::CHarmAnlsChordWithLengthFromJSONDictionary(dictionary);
        CHECK(chord.mRootDistToHarmCenter == 0);
        CHECK(chord.mBassDistToHarmCenter == 10);
        CHECK(chord.mLength == 0.0);
        CHECK(CHarmAnls::Chord::FromDictionary(dictionary).mBassDistToHarmCenter == -1);
        CHECK(CHarmAnls::ChordWithPos::FromDictionary(dictionary).mPosition == kPosUndef);
        CHECK(CHarmAnls::ChordWithLength::FromDictionary(dictionary).mLength == kPosUndef);
        CHECK(CHarmAnls::ChordWithPos::FromDictionary(wrong).mPosition == kPosUndef);
    }
}
