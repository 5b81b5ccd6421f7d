// SPDX-License-Identifier: MIT
#include "tests/chords/ChordForms.h"
#include "tests/support/Expected.h"

#include "brindle/theory/CHarmCenterLite.h"

#include <doctest/doctest.h>

#include <string>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

/// The compact chord on a key in its default spelling.
CChordLite ChordOn(int keyNr, const json& mask) {
    const TEnh enh = MakeSensefulEnhForKeyNrAssumingCMajor(keyNr, TEnh_Undef);
    return {{keyNr, enh}, {}, SemitonesOf(mask)};
}

CSignKeyHeavy SignKeyOf(const json& root, const json& type) {
    return {KeyEnhOf(root),
            type == "minor" ? TSignKeyTypeNoUndef_Minor : TSignKeyTypeNoUndef_Major};
}

json FormOf(const CScaleHeavy& scale) {
    json enhs = json::array();
    for (const TEnh enh : scale.EnhOfKeyNr()) enhs.push_back(static_cast<int>(enh));
    return {{"root", test::FormOf(scale.RootNote())},
            {"type", static_cast<int>(scale.ScaleType())},
            {"semitones", scale.ToSemitones().Mask()},
            {"enh", enhs}};
}

const CSignKeyHeavy kCMajor({0, TEnh_n}, TSignKeyTypeNoUndef_Major);

}  // namespace

TEST_CASE("Chords have the expected functions and scales in a key") {
    CheckExpected(
        "chord_functions",
        {{"CChordHeavy::HarmFuncIn",
          [](const json& in) {
              return ForEachKeyNr([&](int keyNr) {
                  return ChordOn(keyNr, in.at(2)).ToChordHeavy(24).HarmFuncIn(ScaleOf(in));
              });
          }},
         {"CChordHeavy::HarmFuncName",
          [](const json& in) {
              const CSignKeyHeavy signKey = SignKeyOf(in.at(0), in.at(1));
              const CChordNamePrefs prefs{.mChordPrefF = in.at(3).get<int>()};
              return ForEachKeyNr([&](int keyNr) {
                  return ChordOn(keyNr, in.at(2)).ToChordHeavy(24).HarmFuncName(signKey, prefs);
              });
          }},
         {"CChordHeavy::ConstructScaleInSignKey",
          [](const json& in) {
              const CChordHeavy chord = ChordLiteOf(in.at(0)).ToChordHeavy(24);
              return FormOf(chord.ConstructScaleInSignKey(SignKeyOf(in.at(1), in.at(2))));
          }},
         {"CChordHeavy::ConstructScaleInHarmCenter",
          [](const json& in) {
              const CHarmCenterLite center(KeyEnhOf(in.at(1).at("root")),
                                           SemitonesOf(in.at(1).at("semitones")));
              const CChordHeavy chord = ChordLiteOf(in.at(0)).ToChordHeavy(24);
              return FormOf(chord.ConstructScaleInHarmCenter(center));
          }},
         {"CChordHeavy::AdjustEnhOfChordNotesToRootScale", [](const json& in) {
              CChordHeavy chord = ChordHeavyOf(in.at(0));
              chord.AdjustEnhOfChordNotesToRootScale(nullptr);
              return test::FormOf(chord);
          }}});
}

TEST_CASE("A compact chord has the function of its full form") {
    const CChordNamePrefs letters{.mChordPrefF = 1};
    const CChordLite dMinor({2, TEnh_n}, {}, CSemitones{0, 3, 7});
    CHECK(dMinor.HarmFuncIn(kCMajor) == 3);
    CHECK(dMinor.HarmFuncNameIn(kCMajor, {}) == "IIm");
    CHECK(dMinor.HarmFuncNameIn(kCMajor, letters) == "Sp");
    // The triad on the leading tone has a function, the half-diminished chord has none.
    const CKeyEnh b{11, TEnh_n};
    CHECK(CChordLite(b, {}, CSemitones{0, 3, 6}).HarmFuncNameIn(kCMajor, {}) == "VIIdim");
    CHECK(CChordLite(b, {}, CSemitones{0, 3, 6, 10}).HarmFuncNameIn(kCMajor, {}) == "undef");
}

TEST_CASE("Without a root or a key there is no function, degree or scale") {
    const CChordHeavy c({0, TEnh_n}, TBasicChord::Major, CKeyEnh_Undef);
    CHECK(CChordHeavy_Undef().HarmFuncIn(kCMajor) == -1);
    CHECK(CChordHeavy_Undef().HarmFuncName(kCMajor, {}) == "undef");
    CHECK(CChordHeavy_Undef().RootNoteDegreeNrInSignKey(kCMajor) == -1);
    CHECK(CChordHeavy_Undef().BassNoteDegreeNrInSignKey(kCMajor) == -1);
    CHECK(CChordHeavy_Undef().ConstructScaleInSignKey(kCMajor).IsUndef());
    CHECK(CChordHeavy_Undef().ConstructScaleInHarmCenter(CHarmCenterLite_Undef).IsUndef());
    CHECK(c.HarmFuncIn(CScaleHeavy_Undef) == -1);
    CHECK(c.HarmFuncName(CSignKeyHeavy_Undef, {}) == "undef");
    CHECK(c.ConstructScaleInSignKey(CSignKeyLite()).RootKeyNr() == 0);
}

TEST_CASE("The bass degree of a chord is that of its lowest note") {
    const CChordHeavy cOverG({0, TEnh_n}, TBasicChord::Major, CKeyEnh{7, TEnh_n});
    CHECK(cOverG.RootNoteDegreeNrInSignKey(kCMajor) == 0);
    CHECK(cOverG.BassNoteDegreeNrInSignKey(kCMajor) == 4);
    CHECK(CChordHeavy({0, TEnh_n}, TBasicChord::Major, {}).BassNoteDegreeNrInSignKey(kCMajor) == 0);
}

TEST_CASE("Respelling never says that it changed anything, and two spellings may become one") {
    const CNote c(48, TEnh_n);
    CNote dDoubleFlat = c;
    dDoubleFlat.SetEnhAndDontMakeSenseful(TEnh_bb);
    CChordHeavy chord(c, CMySet<CNote>{c, dDoubleFlat, CNote(0, TEnh_n), CNote(0, TEnh_bb)});
    bool changed = true;
    chord.AdjustEnhOfChordNotesToRootScale(&changed);
    CHECK_FALSE(changed);
    CHECK(chord.Notes().size() == 4);
    CHECK(chord.Note(2) == c);
    CHECK(chord.Note(3) == c);
    // The set works on with both.
    chord.DeleteAllNotesInOctave(-1);
    CHECK(chord.Notes().size() == 2);
}
