// SPDX-License-Identifier: MIT
#include "brindle/theory/Spelling.h"
#include "brindle/theory/KeyIntervals.h"
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

/// in: key number and spelling
Answer SpellingBy(TEnh (*rule)(int, TEnh)) {
    return [rule](const json& in) {
        return static_cast<int>(rule(in.at(0).get<int>(), EnhOf(in.at(1))));
    };
}

Answer IntvlBy(int (*intvl)(int, int)) {
    return [intvl](const json& in) { return intvl(in.at(0).get<int>(), in.at(1).get<int>()); };
}

Answer Is(CKeyEnh keyEnh) {
    return [keyEnh](const json&) { return test::FormOf(keyEnh); };
}

json AllUpToOneAccidental(const json&) {
    json keys = json::array();
    for (const CKeyEnh& keyEnh : CKeyEnh_AllUpToOneAccidental) keys.push_back(FormOf(keyEnh));
    return keys;
}

}  // namespace

TEST_CASE("A spelling that no letter has is repaired, and keys are measured by the shorter way") {
    test::CheckExpected(
        "theory-spellings",
        {
            {"IsSensefulEnhForKeyNr",
             [](const json& in) {
                 return IsSensefulEnhForKeyNr(in.at(0).get<int>(), EnhOf(in.at(1)));
             }},
            {"MakeSensefulEnhForKeyNr",
             [](const json& in) {
                 return static_cast<int>(
                     MakeSensefulEnhForKeyNr(in.at(0).get<int>(), EnhOf(in.at(1)),
                                             static_cast<TMakeSensefulEnh>(in.at(2).get<int>())));
             }},
            {"MakeSensefulEnhForKeyNrAssumingCMajor",
             SpellingBy(MakeSensefulEnhForKeyNrAssumingCMajor)},
            {"MakeSensefulEnhForKeyNrMajorScaleRootWithLeastSigns",
             SpellingBy(MakeSensefulEnhForKeyNrMajorScaleRootWithLeastSigns)},
            {"MakeSensefulEnhForKeyNrPreferSharps",
             SpellingBy(MakeSensefulEnhForKeyNrPreferSharps)},
            {"MakeSensefulEnhForKeyNrPreferFlats", SpellingBy(MakeSensefulEnhForKeyNrPreferFlats)},
            {"MakeSensefulEnhForKeyNrOnBlackKeyPreferGivenTEnh",
             SpellingBy(MakeSensefulEnhForKeyNrOnBlackKeyPreferGivenTEnh)},
            {"EnhShiftToFlats", SpellingBy(EnhShiftToFlats)},
            {"EnhShiftToSharps", SpellingBy(EnhShiftToSharps)},
            {"EnhShift", SpellingBy(EnhShift)},
            {"EnhToSemitone", [](const json& in) { return EnhToSemitone(EnhOf(in.at(0))); }},
            {"SemitoneToEnh",
             [](const json& in) { return static_cast<int>(SemitoneToEnh(in.at(0).get<int>())); }},
            {"KeyIntvlFromTo", IntvlBy(KeyIntvlFromTo)},
            {"AbsKeyIntvlFromTo", IntvlBy(AbsKeyIntvlFromTo)},
            {"SmallestKeyIntvlBetween", IntvlBy(SmallestKeyIntvlBetween)},
            {"KeyDistanceBetween", IntvlBy(KeyDistanceBetween)},
            {"SmallestKeyIntvl",
             [](const json& in) { return SmallestKeyIntvl(in.at(0).get<int>()); }},
            {"IsBlackKey", [](const json& in) { return IsBlackKey(in.at(0).get<int>()); }},
            {"IsWhiteKey", [](const json& in) { return IsWhiteKey(in.at(0).get<int>()); }},
            {"StringForInitializerList",
             [](const json& in) { return StringForInitializerList(EnhOf(in.at(0))); }},
            {"CKeyEnh::StringForInitializerList",
             [](const json& in) { return KeyEnhOf(in.at(0)).StringForInitializerList(); }},
            {"CKeyEnh::HasSensefulEnh",
             [](const json& in) { return KeyEnhOf(in.at(0)).HasSensefulEnh(); }},
            {"CKeyEnh_Undef", Is(CKeyEnh_Undef)},
            {"CKeyEnh_AllUpToOneAccidental", AllUpToOneAccidental},
            {"CKeyEnh_Cbbb", Is(CKeyEnh_Cbbb)},
            {"CKeyEnh_Cbb", Is(CKeyEnh_Cbb)},
            {"CKeyEnh_Cb", Is(CKeyEnh_Cb)},
            {"CKeyEnh_C", Is(CKeyEnh_C)},
            {"CKeyEnh_Cis", Is(CKeyEnh_Cis)},
            {"CKeyEnh_Cx", Is(CKeyEnh_Cx)},
            {"CKeyEnh_Cxs", Is(CKeyEnh_Cxs)},
            {"CKeyEnh_Dbbb", Is(CKeyEnh_Dbbb)},
            {"CKeyEnh_Dbb", Is(CKeyEnh_Dbb)},
            {"CKeyEnh_Db", Is(CKeyEnh_Db)},
            {"CKeyEnh_D", Is(CKeyEnh_D)},
            {"CKeyEnh_Dis", Is(CKeyEnh_Dis)},
            {"CKeyEnh_Dx", Is(CKeyEnh_Dx)},
            {"CKeyEnh_Dxs", Is(CKeyEnh_Dxs)},
            {"CKeyEnh_Ebbb", Is(CKeyEnh_Ebbb)},
            {"CKeyEnh_Ebb", Is(CKeyEnh_Ebb)},
            {"CKeyEnh_Eb", Is(CKeyEnh_Eb)},
            {"CKeyEnh_E", Is(CKeyEnh_E)},
            {"CKeyEnh_Eis", Is(CKeyEnh_Eis)},
            {"CKeyEnh_Ex", Is(CKeyEnh_Ex)},
            {"CKeyEnh_Exs", Is(CKeyEnh_Exs)},
            {"CKeyEnh_Fbbb", Is(CKeyEnh_Fbbb)},
            {"CKeyEnh_Fbb", Is(CKeyEnh_Fbb)},
            {"CKeyEnh_Fb", Is(CKeyEnh_Fb)},
            {"CKeyEnh_F", Is(CKeyEnh_F)},
            {"CKeyEnh_Fis", Is(CKeyEnh_Fis)},
            {"CKeyEnh_Fx", Is(CKeyEnh_Fx)},
            {"CKeyEnh_Fxs", Is(CKeyEnh_Fxs)},
            {"CKeyEnh_Gbbb", Is(CKeyEnh_Gbbb)},
            {"CKeyEnh_Gbb", Is(CKeyEnh_Gbb)},
            {"CKeyEnh_Gb", Is(CKeyEnh_Gb)},
            {"CKeyEnh_G", Is(CKeyEnh_G)},
            {"CKeyEnh_Gis", Is(CKeyEnh_Gis)},
            {"CKeyEnh_Gx", Is(CKeyEnh_Gx)},
            {"CKeyEnh_Gxs", Is(CKeyEnh_Gxs)},
            {"CKeyEnh_Abbb", Is(CKeyEnh_Abbb)},
            {"CKeyEnh_Abb", Is(CKeyEnh_Abb)},
            {"CKeyEnh_Ab", Is(CKeyEnh_Ab)},
            {"CKeyEnh_A", Is(CKeyEnh_A)},
            {"CKeyEnh_Ais", Is(CKeyEnh_Ais)},
            {"CKeyEnh_Ax", Is(CKeyEnh_Ax)},
            {"CKeyEnh_Axs", Is(CKeyEnh_Axs)},
            {"CKeyEnh_Bbbb", Is(CKeyEnh_Bbbb)},
            {"CKeyEnh_Bbb", Is(CKeyEnh_Bbb)},
            {"CKeyEnh_Bb", Is(CKeyEnh_Bb)},
            {"CKeyEnh_B", Is(CKeyEnh_B)},
            {"CKeyEnh_Bis", Is(CKeyEnh_Bis)},
            {"CKeyEnh_Bx", Is(CKeyEnh_Bx)},
            {"CKeyEnh_Bxs", Is(CKeyEnh_Bxs)},
        });
}

TEST_CASE("Every rule gives a spelling that makes sense for the key") {
    // The undefined key aside; a key that is already senseful may be respelled, never misspelled.
    using TRule = TEnh (*)(int, TEnh);
    const TRule rules[] = {MakeSensefulEnhForKeyNrAssumingCMajor,
                           MakeSensefulEnhForKeyNrMajorScaleRootWithLeastSigns,
                           MakeSensefulEnhForKeyNrPreferSharps,
                           MakeSensefulEnhForKeyNrPreferFlats,
                           MakeSensefulEnhForKeyNrOnBlackKeyPreferGivenTEnh,
                           EnhShiftToFlats,
                           EnhShiftToSharps,
                           EnhShift};
    for (const TRule rule : rules) {
        for (int keyNr = -2; keyNr < 30; ++keyNr) {
            if (keyNr == kKeyNrUndef) continue;
            for (int enh = -128; enh < 128; ++enh) {
                CAPTURE(keyNr);
                CAPTURE(enh);
                CHECK(IsSensefulEnhForKeyNr(keyNr, rule(keyNr, static_cast<TEnh>(enh))));
            }
        }
    }
}

TEST_CASE("A tritone is six semitones down by the shorter way, and never seven apart") {
    CHECK(SmallestKeyIntvlBetween(0, 6) == -6);
    CHECK(SmallestKeyIntvlBetween(6, 0) == -6);
    CHECK(KeyIntvlFromTo(0, 7) == 7);
    CHECK(KeyDistanceBetween(0, 7) == 5);
}
