// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlNote.h"
#include "brindle/musicxml/CMuxmlPart.h"
#include "brindle/musicxml/CMuxmlSignKey.h"
#include "brindle/musicxml/CMuxmlSignTime.h"
#include "brindle/musicxml/CTransposeNoteCounts.h"
#include "brindle/musicxml/MuxmlEnums.h"
#include "brindle/musicxml/MuxmlJson.h"
#include "brindle/musicxml/TMusicXMLHarmony.h"
#include "brindle/musicxml/XPathHelpers.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/Trace.h"
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include <doctest/doctest.h>

#include <limits>

using namespace brindle;
using nlohmann::json;

namespace {

template <class Enumeration>
json ValueOfWord(const json& in) {
    const std::string word = in.at(0);
    const auto value = mBiMap<Enumeration>.ValueOf(word);
    return value && mBiMap<Enumeration>.WordOf(*value) == word ? json(*value) : json();
}

CMuxmlPitch PitchOf(const json& in) {
    return {static_cast<TMuxmlEnum_Step>(in.at(0).get<int>()), in.at(1), in.at(2)};
}

CMuxmlSignKey SignKeyOf(const json& fifths, const json& mode) {
    CMuxmlSignKey key;
    key.mFifths = fifths;
    key.mMode = static_cast<TMuxmlEnum_SignKeyMode>(mode.get<int>());
    return key;
}

json FormOfSignKey(const CSignKeyHeavy& key) {
    return {key.RootKeyNr(), static_cast<int>(key.RootNote().mEnh),
            static_cast<int>(key.SignKeyType())};
}

json FormOfInstrument(const json& in) {
    CMuxmlScoreInstrument instrument;
    instrument.mInstrumentName = "Name";
    instrument.mInstrumentAbbreviation = "Nm.";
    instrument.mInstrumentSound = in.at(0);
    return {
        {"InstSoundGroup", instrument.InstSoundGroup()},
        {"InstSoundGroupIsStrings", instrument.InstSoundGroupIsStrings()},
        {"InstSoundGroupIsPitchedPrc", instrument.InstSoundGroupIsPitchedPrc()},
        {"InstSoundGroupIsPrc", instrument.InstSoundGroupIsPrc()},
        {"InstSoundAndIfNotExistsYieldToBest", instrument.InstSoundAndIfNotExistsYieldToBest()}};
}

json BestName(const json& in) {
    const json& names = in.at(0);
    CMuxmlPart part;
    part.mPartNameDisplay = names.at("mPartNameDisplay");
    part.mPartName = names.at("mPartName");
    part.mPartAbbreviationDisplay = names.at("mPartAbbreviationDisplay");
    part.mPartAbbreviation = names.at("mPartAbbreviation");
    part.mScoreInstruments.emplace_back().mInstrumentName = names.at("mInstrumentName");
    return part.FindBestPartName();
}

}  // namespace

TEST_CASE("Words of scores are values, instruments have groups, and parts have best names") {
    test::CheckExpected("muxml_words",
                        {
                            {"TMuxmlEnum_YesNo", ValueOfWord<TMuxmlEnum_YesNo>},
                            {"TMuxmlEnum_StartStop", ValueOfWord<TMuxmlEnum_StartStop>},
                            {"TMuxmlEnum_Stem", ValueOfWord<TMuxmlEnum_Stem>},
                            {"TMuxmlEnum_Step", ValueOfWord<TMuxmlEnum_Step>},
                            {"TMuxmlEnum_NoteType", ValueOfWord<TMuxmlEnum_NoteType>},
                            {"TMuxmlEnum_NoteTypeValue", ValueOfWord<TMuxmlEnum_NoteTypeValue>},
                            {"TMuxmlEnum_SymbolSize", ValueOfWord<TMuxmlEnum_SymbolSize>},
                            {"TMuxmlEnum_FontStyle", ValueOfWord<TMuxmlEnum_FontStyle>},
                            {"TMuxmlEnum_FontWeight", ValueOfWord<TMuxmlEnum_FontWeight>},
                            {"TMuxmlEnum_AboveBelow", ValueOfWord<TMuxmlEnum_AboveBelow>},
                            {"TMuxmlEnum_Accidental", ValueOfWord<TMuxmlEnum_Accidental>},
                            {"TMuxmlEnum_FermataShape", ValueOfWord<TMuxmlEnum_FermataShape>},
                            {"TMuxmlEnum_UprightInverted", ValueOfWord<TMuxmlEnum_UprightInverted>},
                            {"TMuxmlEnum_LineShape", ValueOfWord<TMuxmlEnum_LineShape>},
                            {"TMuxmlEnum_LineType", ValueOfWord<TMuxmlEnum_LineType>},
                            {"TMuxmlEnum_SignKeyMode", ValueOfWord<TMuxmlEnum_SignKeyMode>},
                            {"TMuxmlEnum_ClefSign", ValueOfWord<TMuxmlEnum_ClefSign>},
                            {"TMuxmlEnum_ShowTuplet", ValueOfWord<TMuxmlEnum_ShowTuplet>},
                            {"TMuxmlEnum_EnclosureShape", ValueOfWord<TMuxmlEnum_EnclosureShape>},
                            {"TMuxmlEnum_LeftCenterRight", ValueOfWord<TMuxmlEnum_LeftCenterRight>},
                            {"CMuxmlScoreInstrument", FormOfInstrument},
                            {"CMuxmlPart::FindBestPartName", BestName},
                        });
}

TEST_CASE("Written pitches are note numbers, names and spellings") {
    test::CheckExpected(
        "muxml_pitches",
        {
            {"CMuxmlPitch::ToNoteNrLarge",
             [](const json& in) { return PitchOf(in).ToNoteNrLarge(); }},
            {"CMuxmlPitch::ToString", [](const json& in) { return PitchOf(in).ToString(); }},
            {"CMuxmlPitch::AlterationToEnh",
             [](const json& in) {
                 return static_cast<int>(
                     CMuxmlPitch{TMuxmlEnum_Step_C, in.at(0), 4}.AlterationToEnh());
             }},
            {"CMuxmlUnpitched::ToNoteNrLarge",
             [](const json& in) {
                 const CMuxmlUnpitched place{static_cast<TMuxmlEnum_Step>(in.at(0).get<int>()),
                                             in.at(1)};
                 const json& key = in.at(2);
                 return place.ToNoteNrLarge(SignKeyOf(key.at("mFifths"), key.at("mMode")));
             }},
        });
}

TEST_CASE("Key signatures are keys, as written and as heard") {
    test::CheckExpected(
        "muxml_sign_keys",
        {
            {"CMuxmlSignKey::ConvertToCSignKeyTransposedPitch",
             [](const json& in) {
                 return FormOfSignKey(
                     SignKeyOf(in.at(0), in.at(1)).ConvertToCSignKeyTransposedPitch());
             }},
            {"CMuxmlSignKey::ConvertToCSignKeySoundingPitch",
             [](const json& in) {
                 CMuxmlSignKey key = SignKeyOf(in.at(0), in.at(1));
                 key.mPartTransposeAtSignKey.mChromatic = in.at(2);
                 return FormOfSignKey(key.ConvertToCSignKeySoundingPitch());
             }},
        });
}

TEST_CASE("Pitches and keys far off any staff are computed without harm") {
    const float huge = std::numeric_limits<float>::infinity();
    for (const int octave :
         {std::numeric_limits<int>::min(), -1, 0, 20, 21, std::numeric_limits<int>::max()}) {
        for (const float alteration : {-huge, -1e30F, 0.0F, 1e30F, huge}) {
            const CMuxmlPitch pitch{TMuxmlEnum_Step_B, alteration, octave};
            CHECK_FALSE(pitch.ToString().empty());
        }
        CMuxmlSignKey key = SignKeyOf(octave, 1);
        key.mPartTransposeAtSignKey.mChromatic = huge;
        CHECK_FALSE(key.ConvertToCSignKeySoundingPitch().IsUndef());
        const CMuxmlUnpitched place{TMuxmlEnum_Step_B, octave};
        CHECK(FoldIntoOctave(place.ToNoteNrLarge(key)) >= 0);
    }
}

TEST_CASE("Attributes fill the fields of their names, and unknown words leave them") {
    CMuxmlTuplet tuplet;
    tuplet.ReadFromAttributes({{"default-x", " 1.5e1"},
                               {"start-stop", "stop"},
                               {"number", "2"},
                               {"bracket", "yes"},
                               {"show-number", "both"},
                               {"show-type", "none"},
                               {"line-shape", "curved"},
                               {"placement", "beside"}});
    CHECK(TraceString(tuplet) ==
          R"({"CMuxmlXY":{"mDefaultX":15},"mType":"stop","mNumber":2,"mBracket":"yes",)"
          R"("mShowNumber":"both","mShowTuplet":"none","mLineShape":"curved"})");

    CMuxmlScoop scoop;
    scoop.ReadFromAttributes({{"color", "#FF0000"},
                              {"font-family", "Bravura \"x\""},
                              {"font-weight", "bold"},
                              {"line-type", "wavy"},
                              {"dash-length", "0x1F"},
                              {"placement", "below"}});
    CHECK(TraceString(scoop) ==
          R"({"CMuxmlXYColor":{"mColor":0},)"
          R"("CMuxmlFont":{"mFontFamily":"Bravura \"x\"","mFontWeight":"bold"},)"
          R"("mExists":true,"mPlacement":"below","CMuxmlLine":{"mLineType":"wavy"}})");

    CMuxmlAccidental accidental;
    accidental.ReadFromFoundCharactersAndAttributes("double-flat", {{"cautionary", "yes"}});
    CHECK(TraceString(accidental) == R"({"mExists":true,"mCautionary":"yes"})");

    CMuxmlTupletType type;
    type.ReadFromFoundCharactersAndAttributes("32nd", {});
    type.ReadFromFoundCharactersAndAttributes("no such length", {{"font-style", "italic"}});
    CHECK(TraceString(type) == R"({"CMuxmlFontAndColor":{"CMuxmlFont":{"mFontStyle":"italic"}}})");

    CMuxmlSignTime sign;
    sign.ReadFromAttributes({{"number", "-1"}, {"print-object", "no"}, {"symbol", "cut"}});
    sign.SetElementFromString("beats", "2147483647+1+");
    sign.SetElementFromString("senza-misura", "");
    CHECK(TraceString(sign) ==
          R"({"mStaffNumber":18446744073709551615,"mPrintObject":"no","mSymbol":"cut",)"
          R"("mNomAkaBeats":-2147483648,"mCompoundNomsAkaBeats":[2147483647,1,0],)"
          R"("mSenzaMisura":true})");
}

TEST_CASE("Transpositions are ordered by all but the octave") {
    const auto transpose = [](int diatonic, float chromatic, int octave, bool isDouble) {
        CMuxmlTranspose result;
        result.mDiatonic = diatonic;
        result.mChromatic = chromatic;
        result.mOctaveChange = octave;
        result.mDouble = isDouble;
        return result;
    };
    const CMuxmlTranspose flute = transpose(0, 0, 0, false);
    CHECK(transpose(-1, -2, 0, false) < flute);
    CHECK(flute < transpose(0, 0.5F, 0, false));
    CHECK(flute < transpose(0, 0, 0, true));
    for (const CMuxmlTranspose& other : {transpose(0, 0, 1, false), transpose(0, 0, 1, true)}) {
        CHECK_FALSE(flute < other);
        CHECK_FALSE(other < flute);
    }
}

TEST_CASE("Two harmonies are compared by all that sounds, and by their place if asked for") {
    TMusicXMLHarmony harmony;
    harmony.mPosition = 4.0;
    harmony.mRoot = {"B", -1};
    harmony.mKind = "minor";
    CHECK(harmony.mRoot.ToKeyNr({}) == 10);
    CHECK(harmony.mRoot.ToKeyNrAndEnh({}) == CKeyEnh_Bb);
    TMusicXMLHarmony later = harmony;
    later.mPosition = 8.0;
    CHECK_FALSE(harmony.CompareAllMembers(later, TComparePos_Yes));
    CHECK(harmony.CompareAllMembers(later, TComparePos_No));
    later.mBass = {"F", 0};
    CHECK_FALSE(harmony.CompareAllMembers(later, TComparePos_No));
}

TEST_CASE("The transposition of a part is that of most of its notes") {
    CTransposeNoteCounts counts;
    CHECK_FALSE(counts.TransposeWithMostNotes().mHasBeenReadFromXML);
    CMuxmlTranspose clarinet;
    clarinet.mChromatic = -2;
    clarinet.mDiatonic = -1;
    counts.Add(CMuxmlTranspose(), 10);
    counts.Add(clarinet, 6);
    CHECK(counts.TransposeWithMostNotes().mChromatic == 0);
    counts.Add(clarinet, 6);
    CHECK(counts.TransposeWithMostNotes().mChromatic == -2);
}

TEST_CASE("The first node that a path finds is read as what is asked for, else the default") {
    const auto tree = XmlDocument::FromBytes("<a><n> 12x</n><d>2.5</d><t>Forte <b>P</b></t></a>");
    const XmlNode root = std::get<XmlDocument>(tree).rootElement();
    CHECK(IntValueForXPath(root, "n", 7) == 12);
    CHECK(IntValueForXPath(root, "t", 7) == 0);
    CHECK(IntValueForXPath(root, "none", 7) == 7);
    CHECK(DoubleValueForXPath(root, "d", 7.0) == 2.5);
    CHECK(DoubleValueForXPath(root, "none", 7.0) == 7.0);
    CHECK(StringValueForXPath(root, "t", "X") == "Forte P");
    CHECK(StringValueForXPath(root, "none", "X") == "X");
    CHECK(LowercaseStringValueForXPath(root, "t", "X") == "forte p");
    CHECK(LowercaseStringValueForXPath(root, "none", "X") == "X");
    CHECK(NSStringValueForXPath(root, "d", std::nullopt) == "2.5");
    CHECK_FALSE(NSStringValueForXPath(root, "none", std::nullopt).has_value());
    CHECK(XPathExists(root, "t/b"));
    CHECK_FALSE(XPathExists(root, "b"));
    CHECK(XMLElementForXPath(root, "t/b").stringValue() == "P");
    CHECK_FALSE(static_cast<bool>(XMLElementForXPath(root, "none")));
}

TEST_CASE("Instruments of a part are found by identifier, by name and by short name") {
    CMuxmlScoreInstruments instruments(2);
    instruments[0].mID = "P1-I1";
    instruments[0].mInstrumentName = "Piano";
    instruments[1].mID = "P1-I2";
    instruments[1].mInstrumentAbbreviation = "Cl.";
    CHECK(instruments.FindForID("P1-I2") == instruments.begin() + 1);
    CHECK(instruments.FindForID("P1") == instruments.end());
    CHECK(instruments.FindByInstNameOrAbbrevation("Piano") == instruments.begin());
    CHECK(instruments.FindByInstNameOrAbbrevation("Cl.") == instruments.begin() + 1);
    CHECK(instruments.FindByInstNameOrAbbrevation("piano") == instruments.end());
}
