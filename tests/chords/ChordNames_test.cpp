// SPDX-License-Identifier: MIT
#include "tests/chords/ChordForms.h"
#include "tests/support/Expected.h"

#include "brindle/chords/BasicChordNames.h"
#include "brindle/chords/ChordAndScaleStrings.h"
#include "brindle/platform/Localization.h"

#include <doctest/doctest.h>

#include <string>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

using TNaming = std::string (CChordHeavy::*)(const CChordNamePrefs&) const;

/// in: [chord, preferences]
Answer Named(TNaming naming) {
    return
        [naming](const json& in) { return (AnyChordOf(in.at(0)).*naming)(NamePrefsOf(in.at(1))); };
}

json InEachWay(const json& in) {
    json names = json::array();
    for (const TNaming naming :
         {&CChordHeavy::Name, &CChordHeavy::NameWithSlash, &CChordHeavy::NameWithoutSlash}) {
        names.push_back(Named(naming)(in));
    }
    return names;
}

CChordHeavy ChordOfNotes(const json& list) {
    CChordHeavy chord;
    chord.SetFromNoteSet(NotesOf(list));
    return chord;
}

/// {"root": [keyNr, enh], "semitones": mask}
CScaleLite ScaleOfText(const json& form) {
    return {KeyEnhOf(form.at("root")), SemitonesOf(form.at("semitones"))};
}

json FormOfText(const CScaleLite& scale) {
    return {{"root", FormOf(scale.mRootKeyEnh)}, {"semitones", scale.mSemitones.Mask()}};
}

TBasicChord BasicChordOf(const json& number) {
    return static_cast<TBasicChord>(number.get<int>());
}

const CKeyEnh kC{0, TEnh_n};

}  // namespace

TEST_CASE("Every set of semitones has a name over every root and bass") {
    CheckExpected("chord_names",
                  {{"CChordHeavy::Name", Named(&CChordHeavy::Name)},
                   {"CChordHeavy::NameWithSlash", Named(&CChordHeavy::NameWithSlash)},
                   {"CChordHeavy::NameWithoutSlash", Named(&CChordHeavy::NameWithoutSlash)},
                   {"CChordHeavy::OptionName",
                    [](const json& in) {
                        return CChordHeavy::OptionName(
                            static_cast<TChordOption>(in.at(0).get<int>()), NamePrefsOf(in.at(1)));
                    }},
                   {"BasicChordName",
                    [](const json& in) {
                        return BasicChordName(BasicChordOf(in.at(0)), NamePrefsOf(in.at(1)));
                    }},
                   {"BasicChordNameWithPreceedingOptionalSpace", [](const json& in) {
                        return BasicChordNameWithPreceedingOptionalSpace(BasicChordOf(in.at(0)),
                                                                         NamePrefsOf(in.at(1)));
                    }}});
}

TEST_CASE("The options of a chord are found and written in their order") {
    CheckExpected(
        "chord_name_options",
        {{"CChordHeavy::Name", Named(&CChordHeavy::Name)},
         {"CChordHeavy::NameWithSlash", Named(&CChordHeavy::NameWithSlash)},
         {"CChordHeavy::OptionsName", Named(&CChordHeavy::OptionsName)},
         {"CChordHeavy::BasicChordAndOptionsName", Named(&CChordHeavy::BasicChordAndOptionsName)},
         {"CChordHeavy::OptionsMap", [](const json& in) {
              json list = json::array();
              for (const auto& [key, option] :
                   AnyChordOf(in.at(0)).OptionsMap(NamePrefsOf(in.at(1)))) {
                  list.push_back({key, static_cast<int>(option)});
              }
              return list;
          }}});
}

TEST_CASE("Each preference changes its part of a chord name and no other") {
    CheckExpected("chord_names_prefs", {{"CChordHeavy", InEachWay}});
}

TEST_CASE("A set of notes is named with any key as its root") {
    CheckExpected("chord_names_other_root",
                  {{"CChordHeavy::NameForThisRootNote",
                    [](const json& in) {
                        return ChordOfNotes(in.at(0)).NameForThisRootNote(NoteOf(in.at(1)),
                                                                          NamePrefsOf(in.at(2)));
                    }},
                   {"CChordHeavy::NameWithLeastSignsForThisRootNote", [](const json& in) {
                        CNote root = NoteOf(in.at(1));
                        const std::string name =
                            ChordOfNotes(in.at(0)).NameWithLeastSignsForThisRootNote(
                                root, NamePrefsOf(in.at(2)));
                        return json{name, static_cast<int>(root.mEnh)};
                    }}});
}

TEST_CASE("A chord and its scale are read and written in one text") {
    CheckExpected("chord_and_scale_texts",
                  {{"ChordAndScaleFromString",
                    [](const json& in) {
                        const auto [chord, scale] = ChordAndScaleFromString(
                            in.at(0).get<std::string>(), NamePrefsOf(in.at(1)));
                        return json{FormOf(chord), FormOfText(scale)};
                    }},
                   {"ChordAndScaleToString", [](const json& in) {
                        return ChordAndScaleToString(ChordLiteOf(in.at(0)), ScaleOfText(in.at(1)),
                                                     NamePrefsOf(in.at(2)));
                    }}});
    const auto [chord, scale] = ChordAndScaleFromString(nullptr, CChordNamePrefs());
    CHECK(chord == CChordLite_Undef);
    CHECK(scale.IsUndef());
}

TEST_CASE("A chord without a root says which of the three it is") {
    const CChordNamePrefs prefs;
    CHECK(CChordHeavy_Undef().Name(prefs) == "No Chord");
    CHECK(CChordHeavy_NoChordYield().Name(prefs) == "No Chord Yield");
    CHECK(CChordHeavy_NoChordForce().Name(prefs) == "No Chord Force");

    const CChordHeavy triad = ChordOfNotes({{48, 2}, {52, 2}, {55, 2}});
    CHECK(triad.NameForThisRootNote(CNote_Undef, prefs) == "No Chord");
    // A natural on no key is spelled as E flat, which is how that chord is marked.
    CNote natural;
    natural.mEnh = TEnh_n;
    CHECK(triad.NameForThisRootNote(natural, prefs) == "No Chord Force");
    CNote smallUndef;
    smallUndef.mNoteNr = kNoteNrSmallUndef;
    smallUndef.mEnh = TEnh_b;
    CHECK(triad.NameForThisRootNote(smallUndef, prefs) == "No Chord");
    CHECK(triad.NameWithLeastSignsForThisRootNote(smallUndef, prefs) == "No Chord");
}

TEST_CASE("A minor root in a language without a word for it has no letter to lower") {
    SetLocalizer([](const std::string&) { return std::string(); });
    const CChordNamePrefs prefs{
        .mSolfege = true, .mLocalizeSolfege = true, .mLowerCaseMinorRoot = true};
    CHECK(CChordHeavy(kC, CSemitones{0, 3, 7}, CKeyEnh_Undef).Name(prefs) == "m");
    SetLocalizer(nullptr);
}

TEST_CASE("A bass behind the slash is spelled by the scale of its chord and stays so") {
    const CChordNamePrefs prefs{.mAsciiAccidentals = 1};
    const CChordHeavy chord(kC, CSemitones{0, 3, 7}, CKeyEnh{10, TEnh_s});
    CHECK(chord.BassKeyEnh().mEnh == TEnh_s);
    CHECK(chord.Name(prefs) == "Cm/Bb");
    CHECK(chord.BassKeyEnh().mEnh == TEnh_b);

    // No catalogued scale has these keys, so that there is no spelling for the bass.
    const CChordHeavy nameless(kC, CSemitones{0, 4, 7}, CKeyEnh{1, TEnh_b});
    CHECK(nameless.Name(prefs) == "C/C#");
    CHECK(nameless.BassKeyEnh().mEnh == TEnh_Undef);

    const CNote c(48, TEnh_n);
    const CChordHeavy withUndefinedNote(c, CMySet<CNote>{CNote_Undef, c});
    CHECK(withUndefinedNote.NameWithSlash(prefs).ends_with("/Undefined"));
}
