// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/analysis/ScaleLite.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

constexpr TEnh kFlatBlackKeys[] = {TEnh_n, TEnh_b, TEnh_n, TEnh_b, TEnh_n, TEnh_n,
                                   TEnh_b, TEnh_n, TEnh_b, TEnh_n, TEnh_b, TEnh_n};

CKeyEnh FlatKey(int keyNr) {
    return {keyNr, kFlatBlackKeys[keyNr]};
}

/// One digit for the chord on each of the twelve roots.
template <class Test>
json DigitsFor(const json& in, Test test) {
    const CScaleLite scale{KeyEnhOf(in.at(0).at(0)), SemitonesOf(in.at(0).at(1))};
    std::string digits;
    for (int root = 0; root < 12; ++root) {
        CChordLite chord(FlatKey(root), CKeyEnh_Undef, SemitonesOf(in.at(1)));
        if (in.at(2) != "none") chord.mBassKeyEnh = FlatKey((root + in.at(2).get<int>()) % 12);
        digits += test(chord, scale) ? '1' : '0';
    }
    return digits;
}

}  // namespace

TEST_CASE("A scale tolerates its own chords, its dominants and the borrowed ones") {
    CheckExpected(
        "scale_compatibility",
        {{"ScaleLite::ChordIsCompatibleWithScale",
          [](const json& in) { return DigitsFor(in, ScaleLite::ChordIsCompatibleWithScale); }},
         {"ScaleLite::IsCompatibleOutlierChordOfScale", [](const json& in) {
              return DigitsFor(in, ScaleLite::IsCompatibleOutlierChordOfScale);
          }}});
}

TEST_CASE("A chord without notes is at home everywhere, even without a scale") {
    const CScaleLite cMajor{{0, TEnh_n}, kSemitonesMajor};
    const CScaleLite noMode{{0, TEnh_n}, CSemitones_Undef};
    const CChordLite g({7, TEnh_n}, CKeyEnh_Undef, CSemitones(145));
    for (const CScaleLite& scale : {cMajor, noMode, CScaleLite_Undef}) {
        CHECK(ScaleLite::ChordIsCompatibleWithScale(CChordLite_Undef, scale));
        CHECK(ScaleLite::ChordIsCompatibleWithScale(CChordLite_NoChordForce, scale));
    }
    CHECK_FALSE(ScaleLite::ChordIsCompatibleWithScale(g, noMode));
    CHECK_FALSE(ScaleLite::ChordIsCompatibleWithScale(g, CScaleLite_Undef));
}
