// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsChord.h"
#include "brindle/chords/CChordHeavy.h"
#include "brindle/musicxml/CChordSetFromMusicXml.h"
#include "brindle/musicxml/HarmonyKinds.h"
#include "brindle/musicxml/MusicXmlParserHarmonyDelegate.h"
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/musicxml/TMusicXMLHarmony.h"
#include "brindle/platform/XmlStreamParser.h"
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

TEST_CASE("A chord has the kind of its tones, whatever its root") {
    CHECK(ChordToXMLHarmonyKind(CHarmAnlsChord(CChordLite("C", {}))) == "major");
    CHECK(ChordToXMLHarmonyKind(CHarmAnlsChord(CChordLite("F#m7b5", {}))) == "half-diminished");
    CHECK(ChordToXMLHarmonyKind(CHarmAnlsChord(CChordLite("G7/F", {}))) == "dominant");
    CHECK(ChordToXMLHarmonyKind(CHarmAnlsChord()) == "none");
}

TEST_CASE("A reading of harmonies hands out copies of what it has gathered") {
    XmlStreamParser parser;
    MusicXmlParserHarmonyDelegate delegate;
    parser.setDelegate(&delegate);
    const std::string bar =
        "<harmony><root><root-step>C</root-step></root><kind>major</kind></harmony>";
    const auto words = [](const std::string& text) {
        return "<direction><direction-type>" + text + "</direction-type></direction>";
    };
    REQUIRE(parser.parse("<score-partwise><part><measure>" + words("<coda/>") + bar +
                         "</measure><measure>" + words("<coda/>") +
                         "</measure></part></score-partwise>"));
    CHECK(delegate.getMeasures().size() == 2);
    CHECK(delegate.getCodaPairs() == MusicXmlParserHarmonyDelegate::TMeasurePairs{{0, 1}});
    CHECK(delegate.getSegnoPairs().empty());
    CHECK(delegate.getDoc().Harmonies.size() == 1);
    CHECK(delegate.takeDoc().Harmonies.size() == 1);
}
