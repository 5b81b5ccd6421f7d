// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/theory/CChordNamePrefs.h"

#include <doctest/doctest.h>

#include <vector>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

json ScaleForm(const CScaleHeavy& scale) {
    return {{"mRootNote", FormOf(scale.RootNote())},
            {"mScaleType", static_cast<int>(scale.ScaleType())},
            {"mEnhOfKeyNr", scale.EnhOfKeyNr()},
            {"SignsCount", scale.SignsCount()},
            {"ToKeyNrSet", scale.ToKeyNrSet()}};
}

/// [[keyNr, enh], type], or [keyNr, type] for a root without a spelling
json NamedScale(const json& in) {
    const bool hasSpelling = in.at(0).is_array();
    const auto type = static_cast<TScaleType>(in.at(1).get<int>());
    const CScaleHeavy scale = hasSpelling ? ScaleOf(in) : CScaleHeavy(in.at(0).get<int>(), type);
    json form = ScaleForm(scale);
    if (scale.IsUndef()) {
        return {{"mRootNote", form["mRootNote"]},
                {"mEnhOfKeyNr", form["mEnhOfKeyNr"]},
                {"SignsCount", form["SignsCount"]}};
    }
    form["FullName"] = scale.FullName(CurrentChordNamePrefs);
    form["ToSemitones"] = scale.ToSemitones().Mask();
    if (hasSpelling) {
        form["RelatedIonianScaleRootKeyEnh"] = FormOf(scale.RelatedIonianScaleRootKeyEnh());
    }
    return form;
}

/// The scale that [root, mask], [root, {"CIntvlSet"}] or [root, {"CMySet"}] makes
CScaleHeavy MadeFromTones(const json& in) {
    const CKeyEnh root = KeyEnhOf(in.at(0));
    const json& tones = in.at(1);
    if (tones.is_number()) return {root, SemitonesOf(tones)};
    if (tones.contains("CIntvlSet")) return {root, IntvlSetOf(tones.at("CIntvlSet"))};
    const CMySet<int> keyNrs = IntvlSetOf(tones.at("CMySet"));
    return {root, keyNrs};
}

json CustomScale(const json& in) {
    const CScaleHeavy scale = MadeFromTones(in);
    const auto& offsets = scale.ScaleRow().mDegreeToRootOffsetIntvl;
    json form = ScaleForm(scale);
    form["DegreesPerOctave"] = scale.DegreesPerOctave();
    form["mDegreeToRootOffsetIntvl"] =
        std::vector<int>(offsets.begin(), offsets.begin() + scale.ScaleRow().StoredDegreeCount());
    return form;
}

/// The JSON text read back, without the name, which depends on the preferences
json JSONWithoutName(const json& in) {
    json text = json::parse(JSONStringOf(ScaleOf(in)));
    text.at("root").erase("name");
    return text;
}

}  // namespace

TEST_CASE("Named scales have the expected spellings, signs and names") {
    CheckExpected(
        "theory-scales",
        {
            {"CScaleHeavy", NamedScale},
            {"CScaleHeavy::AppendJSONString", JSONWithoutName},
            {"CScaleHeavy::FullName",
             [](const json& in) { return ScaleOf(in.at(0)).FullName(NamePrefsOf(in.at(1))); }},
            {"CScaleHeavy::SetEnhForKeyNr",
             [](const json& in) {
                 CScaleHeavy scale = ScaleOf(in.at(0));
                 scale.SetEnhForKeyNr(in.at(1).get<int>(), EnhOf(in.at(2)));
                 return json{{"mEnhOfKeyNr", scale.EnhOfKeyNr()}};
             }},
            {"CNote::AdjustEnhToScale",
             [](const json& in) {
                 CNote note = NoteOf(in.at(0));
                 note.AdjustEnhToScale(ScaleOf(in.at(1)));
                 return FormOf(note);
             }},
        });
}

TEST_CASE("Scales made from tones are the expected named or custom scales") {
    CheckExpected("theory-custom-scales", {{"CScaleHeavy", CustomScale}});
}

TEST_CASE("A set of steps in the table of scales is never a custom scale") {
    for (const CScaleRow& row : kScaleCatalogue) {
        const CScaleHeavy scale(CKeyEnh_D, row.Semitones());
        const bool isTwin = row.mType == BebopDominant;
        CHECK(scale.ScaleType() == (isTwin ? st_majaddb7 : row.mType));
    }
}

TEST_CASE("A custom scale keeps steps beyond the octave, but twelve at most") {
    CScaleHeavy ninth(CKeyEnh_C, CIntvlSet(0, 4, 7, 14));
    CHECK(ninth.ScaleType() == st_custom);
    CHECK_FALSE(ninth.HasIntvl(2));
    CHECK(ninth.HasIntvl(14));
    CHECK(ninth.HasKeyNr(2));

    CMySet<int> wide;
    for (int intvl = 0; intvl < 20; ++intvl) wide.insert(intvl * 13);
    const CScaleHeavy scale(CKeyEnh_C, CIntvlSet(wide));
    CHECK(scale.DegreesPerOctave() == 20);
    CHECK(scale.ToIntvlSet().size() == 12);
    CHECK(scale.DegreeNrToKeyNr(19) == 0);
    CHECK(scale.MoveInScale(60, 41) == 60 + 2 * 12 + 1);
}

TEST_CASE("A custom scale can change its steps, and a named one becomes custom by type") {
    CScaleHeavy scale(CKeyEnh_C, CSemitones{0, 4, 7});
    scale.SetCustomScaleRootOffsetIntvlSet_ResetCustomScaleData(CIntvlSet(0, 3, 7));
    CHECK(scale.ToSemitones() == CSemitones{0, 3, 7});
    CHECK(scale.SignsCount() == -3);  // a minor third and no major one: the signs of C minor
    CHECK(scale != CScaleHeavy(CKeyEnh_C, CSemitones{0, 4, 7}));

    scale.SetFromRootKeyEnhAndScaleType_DontResetCustomScaleData(CKeyEnh_D, st_maj);
    CHECK(scale == CScaleHeavy(CKeyEnh_D, st_maj));
    scale.SetScaleType(st_custom);
    CHECK(scale.ToSemitones() == CSemitones{0, 3, 7});
    CHECK(scale.EnhForKeyNr(2) == TEnh_Undef);

    CScaleHeavy chromatic = scale;
    chromatic.InitCustomScaleData();
    CHECK(chromatic.ToSemitones() == CSemitones(4095));
    CHECK(chromatic.ScaleType() == st_custom);
    CHECK(chromatic.RootKeyEnh() == CKeyEnh_D);

    const CScaleHeavy copy = scale;
    scale.SetFromRootKeyEnhAndScaleType_ResetCustomScaleData(CKeyEnh_D, st_custom);
    CHECK(scale.ToSemitones() == CSemitones(4095));
    CHECK(copy.ToSemitones() == CSemitones{0, 3, 7});
}

TEST_CASE("The root is repaired when it is set as a key and kept when it is set as a note") {
    const CNote unspelled = [] {
        CNote note;
        note.mNoteNr = 61;
        return note;
    }();
    CScaleHeavy scale(unspelled, st_maj);
    CHECK(scale.RootKeyEnh() == CKeyEnh_Cis);
    CHECK(scale.RootNote().mNoteNr == 1);
    CHECK(scale.SignsCount() == 7);

    scale.SetRootNote(unspelled);
    CHECK(scale.RootNote() == unspelled);
    CHECK(scale.SignsCount() == -5);  // no spelling: D flat has the fewest signs
    CHECK(scale.EnhForKeyNr(1) == TEnh_b);
    CHECK(scale != CScaleHeavy(CKeyEnh_Db, st_maj));

    scale.SetRootKeyEnh({8, TEnh_sss});
    CHECK(scale.RootKeyEnh() == CKeyEnh_Gis);
}

TEST_CASE("A root without a place in the cycle of fifths counts as far out") {
    CScaleHeavy scale(CKeyEnh_C, st_maj);
    CNote strange(60, TEnh_n);
    for (const int enh : {6, 100, -128}) {
        strange.SetEnhAndDontMakeSenseful(static_cast<TEnh>(enh));
        scale.SetRootNote(strange);
        CHECK(scale.SignsCount() == (enh < 0 ? -13 : 13));
        scale.SetScaleType(enh == 100 ? static_cast<TScaleType>(-3) : st_maj);
        CHECK(scale.EnhForKeyNr(0) != TEnh_Undef);
    }
}

TEST_CASE("Nothing belongs to an undefined scale") {
    for (const CScaleHeavy& scale :
         {CScaleHeavy(), CScaleHeavy(CKeyEnh_Undef, st_maj), CScaleHeavy(CKeyEnh_C, st_Undef)}) {
        CHECK_FALSE(scale.HasKeyNr(0));
        CHECK_FALSE(scale.HasNoteNr(60));
        CHECK(scale.SignsCount() == 0);
        CHECK(scale.EnhForKeyNr(0) == TEnh_Undef);
        CHECK(scale.MoveInScale(61, 3) == 61);
        CHECK(scale.MoveInScale(CNote(61, TEnh_b), 3) == CNote(61, TEnh_b));
    }
    CHECK(CScaleHeavy() == CScaleHeavy_Undef);
    CHECK(CScaleHeavy_Undef.ToKeyNrSet().empty());
    CHECK(CScaleHeavy_Undef.DegreeNrToKeyNr(2) == kKeyNrUndef);
    CHECK(CScaleHeavy_Undef.DegreeNrToNoteNr(2, 4) == kNoteNrUndef);
}

TEST_CASE("A key number without a spelling takes the root with fewer signs") {
    CHECK(CScaleHeavy(1, st_maj).RootKeyEnh() == CKeyEnh_Db);
    CHECK(CScaleHeavy(6, st_maj).RootKeyEnh() == CKeyEnh_Fis);
    CHECK(CScaleHeavy(15, st_maj).IsUndef());
}

TEST_CASE("A mode has the notes of its major scale") {
    const struct {
        CKeyEnh mRoot;
        TScaleType mType;
        CKeyEnh mMajorRoot;
    } rows[] = {{CKeyEnh_C, st_maj, CKeyEnh_C},
                {{2, TEnh_n}, st_dorian, CKeyEnh_C},
                {{4, TEnh_n}, st_phrygian, CKeyEnh_C},
                {{7, TEnh_n}, st_mixolydian, CKeyEnh_C}};
    for (const auto& row : rows) {
        const CScaleHeavy mode(row.mRoot, row.mType);
        const CScaleHeavy major = mode.RelatedIonianScale();
        CHECK(major.RootKeyEnh() == row.mMajorRoot);
        CHECK(major.ScaleType() == st_maj);
        CHECK(major.ToKeyNrSet() == mode.ToKeyNrSet());
    }
}

TEST_CASE("A scale spells a black key as it is told, by its step or by a note of it") {
    CScaleHeavy scale(CKeyEnh{7, TEnh_n}, st_maj);
    CHECK(scale.EnhForKeyNr(6) == TEnh_s);
    scale.SetEnhForNote(CNote(66, TEnh_s), TEnh_b);
    CHECK(scale.EnhForKeyNr(6) == TEnh_b);
    scale.SetEnhForChromStep(11, TEnh_s);  // F sharp is eleven semitones above G
    CHECK(scale.EnhForKeyNr(6) == TEnh_s);
}

TEST_CASE("A scale answers with the steps of any type") {
    const CScaleHeavy scale(CKeyEnh_D, st_min);
    CHECK(&scale.ScaleDataFromType(st_min) == &scale.ScaleRow());
    const CScaleHeavy major(CKeyEnh_C, st_maj);
    CHECK(&scale.ScaleDataFromType(st_maj) == &major.ScaleRow());
}
