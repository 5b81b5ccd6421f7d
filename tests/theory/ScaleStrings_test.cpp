// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/ScaleMasks.h"
#include "brindle/theory/ScaleStrings.h"

#include <doctest/doctest.h>

using namespace brindle;
using nlohmann::json;

namespace {

/// {"CScaleLite": text} or {"CScaleHeavy": text}, then the preferences
json ReadScale(const json& in) {
    const CChordNamePrefs prefs = test::NamePrefsOf(in.at(1));
    if (in.at(0).contains("CScaleLite")) {
        return test::FormOf(CScaleLite(in.at(0).at("CScaleLite").get<std::string>(), prefs));
    }
    const CScaleHeavy scale(in.at(0).at("CScaleHeavy").get<std::string>(), prefs);
    return {{"mRootNote", test::FormOf(scale.RootKeyEnh())},
            {"mScaleType", static_cast<int>(scale.ScaleType())},
            {"SignsCount", scale.SignsCount()}};
}

CScaleLite Read(std::string_view text) {
    return CScaleLite(text, {});
}

}  // namespace

TEST_CASE("A scale string gives root and type") {
    test::CheckExpected(
        "theory-scale-strings",
        {{"SetFromString", ReadScale}, {"_SemitonesScaleFromString", [](const json& in) {
                                            int pos = in.at(1).get<int>();
                                            const CSemitones semitones = _SemitonesScaleFromString(
                                                in.at(0).get<std::string>(), pos);
                                            return json{semitones.Mask(), pos};
                                        }}});
}

TEST_CASE("A sign in UTF-8 reads as it looks") {
    CHECK(Read("E♭ dorian") == CScaleLite(CKeyEnh_Eb, CSemitones(1709)));
    CHECK(Read("F♯m") == CScaleLite(CKeyEnh_Fis, kSemitonesNaturalMinor));
    CHECK(Read("C mixo ♭9 ♭13") == CScaleLite(CKeyEnh_C, CSemitones(1459)));
}

TEST_CASE("What is no word of a scale means major") {
    // Blanks do not count in the length, but they do among the letters.
    for (const char* text :
         {"C", "C  ", "C foo", "C dorianx", "C harmonic  minor", "C lydian aug"}) {
        CAPTURE(text);
        CHECK(Read(text) == CScaleLite(CKeyEnh_C, kSemitonesMajor));
    }
    CHECK(Read("minor") == CScaleLite(CKeyEnh_Undef, kSemitonesNaturalMinor));
    // The word begins with the letter D.
    CHECK(Read("dorian") == CScaleLite(CKeyEnh_D, kSemitonesMajor));
}

TEST_CASE("A mask leads back to the type of the scale") {
    for (int type = st_maj; type < st_Count; ++type) {
        if (type == st_custom) continue;
        CAPTURE(type);
        const auto scaleType = static_cast<TScaleType>(type);
        CHECK(ScaleTypeFromSemitones(SemitonesFromScaleType(scaleType)) == scaleType);
    }
    CHECK(SemitonesFromScaleType(st_custom) == CSemitones_Undef);
    CHECK(SemitonesFromScaleType(st_Count) == CSemitones_Undef);
    CHECK(SemitonesFromScaleType(static_cast<TScaleType>(-1)) == CSemitones_Undef);
    CHECK(ScaleTypeFromSemitones(CSemitones_Undef) == st_Undef);
    // The whole-tone scale has no name in the table.
    CHECK(ScaleTypeFromSemitones(CSemitones(1365)) == st_custom);
    CHECK(ScaleTypeFromSemitones(CSemitones(3765)) == st_majaddb7);
}
