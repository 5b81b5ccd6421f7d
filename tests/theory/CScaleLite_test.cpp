// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CScaleLite.h"

#include <doctest/doctest.h>

using namespace brindle;
using nlohmann::json;
using test::FormOf;
using test::ScaleLiteOf;

namespace {

CScaleLite Rotated(CScaleLite scale, CKeyEnh root) {
    scale.RotateRootToKeyEnh(root);
    return scale;
}

/// {"CScaleHeavy": [root, type]}
CScaleHeavy ScaleHeavyOf(const json& form) {
    const json& scale = form.at("CScaleHeavy");
    return {test::KeyEnhOf(scale.at(0)), static_cast<TScaleType>(scale.at(1).get<int>())};
}

/// A chord without bass, in the form of a scale.
CChordLite ChordOf(const json& form) {
    return {test::KeyEnhOf(form.at("mRootKeyEnh")), CKeyEnh_Undef,
            test::SemitonesOf(form.at("mSemitones"))};
}

json FormOfTriad(const CChordLite& chord) {
    return {{"mRootKeyEnh", FormOf(chord.mRootKeyEnh)}, {"mSemitones", chord.mSemitones.Mask()}};
}

}  // namespace

TEST_CASE("A compact scale knows its notes and its relatives") {
    test::CheckExpected(
        "theory-compact-scales",
        {
            {"CScaleLite::ParallelModalScale",
             [](const json& in) { return FormOf(ScaleLiteOf(in.at(0)).ParallelModalScale()); }},
            {"CScaleLite::RelatedIonianModalScale",
             [](const json& in) {
                 return FormOf(ScaleLiteOf(in.at(0)).RelatedIonianModalScale());
             }},
            {"CScaleLite::RotateRootToKeyEnh",
             [](const json& in) {
                 return FormOf(Rotated(ScaleLiteOf(in.at(0)), test::KeyEnhOf(in.at(1))));
             }},
            {"CScaleLite::HasKeyNr",
             [](const json& in) { return ScaleLiteOf(in.at(0)).HasKeyNr(in.at(1).get<int>()); }},
            {"CScaleLite::DistToRootKey",
             [](const json& in) {
                 return ScaleLiteOf(in.at(0)).DistToRootKey(in.at(1).get<int>());
             }},
            {"CScaleLite::AppendJSONString",
             [](const json& in) { return test::JSONStringOf(ScaleLiteOf(in.at(0))); }},
            {"CScaleLite::IsModalScale",
             [](const json& in) { return ScaleLiteOf(in.at(0)).IsModalScale(); }},
            {"CScaleLite::IsModalScaleMajor",
             [](const json& in) { return ScaleLiteOf(in.at(0)).IsModalScaleMajor(); }},
            {"CScaleLite::IsModalScaleMinor",
             [](const json& in) { return ScaleLiteOf(in.at(0)).IsModalScaleMinor(); }},
            {"CScaleLite",
             [](const json& in) { return FormOf(CScaleLite(ScaleHeavyOf(in.at(0)))); }},
            {"CScaleLite::ChordTriadForScale",
             [](const json& in) {
                 return FormOfTriad(ScaleLiteOf(in.at(0)).ChordTriadForScale());
             }},
            {"CScaleLite::ConstructScaleForChord",
             [](const json& in) {
                 return ScaleLiteOf(in.at(0))
                     .ConstructScaleForChord(ChordOf(in.at(1)))
                     .mSemitones.Mask();
             }},
        });
}

TEST_CASE("The root of a compact scale is spelled with the fewest signs") {
    const auto respelled = [](CKeyEnh root, CSemitones semitones) {
        CScaleLite scale(root, semitones);
        scale.SetRootKeyEnhWithLeastSigns();
        return scale.mRootKeyEnh;
    };
    CHECK(respelled(CKeyEnh_Gis, kSemitonesMajor) == CKeyEnh_Ab);
    CHECK(respelled(CKeyEnh_Db, kSemitonesNaturalMinor) == CKeyEnh_Cis);
    CHECK(respelled(CKeyEnh_Gb, kSemitonesMajor) == CKeyEnh_Gb);
    CHECK(respelled(CKeyEnh_Fis, kSemitonesMajor) == CKeyEnh_Fis);
    CHECK(respelled(CKeyEnh_Undef, kSemitonesMajor) == CKeyEnh_Undef);
}
