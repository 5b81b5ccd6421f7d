// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsChord.h"
#include "brindle/chords/CChordHeavy.h"
#include "brindle/musicxml/CChordSetFromMusicXml.h"
#include "brindle/musicxml/HarmonyKinds.h"
#include "brindle/musicxml/TMusicXMLHarmony.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include <doctest/doctest.h>

using namespace brindle;
using nlohmann::json;

namespace {

TMusicXMLPitch PitchOf(const json& form, const char* key) {
    if (!form.contains(key)) return {};
    return {form.at(key).at("mStep"), form.at(key).at("mAlter")};
}

TMusicXMLHarmony HarmonyOf(const json& form) {
    TMusicXMLHarmony harmony;
    harmony.mRoot = PitchOf(form, "mRoot");
    harmony.mBass = PitchOf(form, "mBass");
    harmony.mKind = form.value("mKind", "");
    for (const json& degree : form.value("mDegrees", json::array())) {
        harmony.mDegrees.push_back({degree.at("mValue"), degree.at("mAlter"), degree.at("mType")});
    }
    return harmony;
}

json ListOf(const CIntvlSet& intvls) {
    json list = json::array();
    for (const int intvl : intvls) list.push_back(intvl);
    return list;
}

json ChordForm(const CChordHeavy& chord, bool hasBass) {
    json form{{"RootKeyEnh", test::FormOf(chord.RootKeyEnh())},
              {"Semitones", chord.Semitones().Mask()}};
    if (hasBass) {
        form["BassKeyEnh"] = test::FormOf(chord.BassKeyEnh());
    } else {
        form["IntvlSet"] = ListOf(chord.IntvlSet());
    }
    return form;
}

TMusicXMLPitch PitchOf(const json& in) {
    return {in.at(0).get<std::string>(), in.at(1).get<std::int32_t>()};
}

}  // namespace

TEST_CASE("Kinds of lead-sheet chords stand for their tones, and tones for kinds") {
    test::CheckExpected(
        "muxml_kinds",
        {
            {"XMLHarmonyKindToIntvlSetExceptRoot",
             [](const json& in) {
                 return ListOf(XMLHarmonyKindToIntvlSetExceptRoot(in.at(0).get<std::string>()));
             }},
            {"XMLHarmonyKindToSemitones",
             [](const json& in) {
                 return XMLHarmonyKindToSemitones(in.at(0).get<std::string>()).Mask();
             }},
            {"SemitonesToXMLHarmonyKind",
             [](const json& in) {
                 return std::string(SemitonesToXMLHarmonyKind(test::SemitonesOf(in.at(0))));
             }},
        });
    // Semitones above the octave do not count.
    CHECK(SemitonesToXMLHarmonyKind(CSemitones(std::uint64_t{145 | 1 << 14})) == "major");
}

TEST_CASE("Roots and basses of lead sheets are spelled by letter and alteration") {
    test::CheckExpected(
        "muxml_harmony_pitches",
        {
            {"TMusicXMLPitch::ToKeyEnh",
             [](const json& in) {
                 return test::FormOf(PitchOf(in).ToKeyEnh(CurrentChordNamePrefs));
             }},
            {"TMusicXMLPitch::IsDefined", [](const json& in) { return PitchOf(in).IsDefined(); }},
        });
}

TEST_CASE("Lead-sheet chords become full chords with their degrees and bass") {
    test::CheckExpected("muxml_chords", {{"CChordSetFromMusicXml", [](const json& in) {
                                              const TMusicXMLHarmony harmony = HarmonyOf(in.at(0));
                                              const int wrapIntvl = in.at(1);
                                              CChordHeavy updated(wrapIntvl);
                                              CChordSetFromMusicXml(harmony, updated,
                                                                    CurrentChordNamePrefs);
                                              return ChordForm(updated, harmony.mBass.IsDefined());
                                          }}});
}
