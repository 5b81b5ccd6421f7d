// SPDX-License-Identifier: MIT
// What a measure says in `attributes`: divisions, key, time, clefs, transposition.
#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Measure.h"
#include "brindle/musicxml/internal/ElementTable.h"
#include "brindle/musicxml/internal/ReadMuxml.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace brindle {

namespace {

using TMeasure = XMLParserDelegate_RecursiveMuxml_Measure;
using TParser = XmlStreamParser&;
using TText = std::string_view;

// The code that a host sees in the alert about divisions.
constexpr int kBadDivisions = 1;

std::uint64_t UnsignedOrZero(std::string_view text) {
    return static_cast<std::uint64_t>(std::max(0, ReadInteger(text)));
}

/// Forgets the record of the element before; a new one begins with what its attributes say.
template <auto Record>
void Begin(TMeasure& measure, TParser, TText) {
    measure.*Record = {};
    (measure.*Record).ReadFromAttributes(measure.currentAttributes);
}

struct CAttributesRow {
    std::string_view mElement;
    /// The element around it; "" for any.
    std::string_view mInside;
    void (*mRead)(TMeasure& measure, TParser parser, TText text);
};

// Each is done with the empty text at the start of the element, and once more if there is a text.
// clang-format off
// These count inside `time`, too, where every other element belongs to the time signature.
constexpr muxml::CElementTable kElementsEverywhere(std::to_array<CAttributesRow>({
    {"divisions", "",    [](TMeasure& m, TParser p, TText t) { m.FoundDivisions(p, t); }},
    {"key",       "",    Begin<&TMeasure::EncounteredSignKey>},
    {"fifths",    "key", [](TMeasure& m, TParser, TText t) { m.EncounteredSignKey.mFifths = ReadInteger(t); }},
    {"mode",      "key", [](TMeasure& m, TParser, TText t) { m.EncounteredSignKey.mMode = MuxmlValueOf(t, TMuxmlEnum_SignKeyMode_Major); }},
    {"time",      "",    Begin<&TMeasure::EncounteredSignTime>},
}));
constexpr muxml::CElementTable kElementsOutsideTime(std::to_array<CAttributesRow>({
    {"staves",             "",          [](TMeasure& m, TParser, TText t) { m.EncounteredMeasure.mStaves = UnsignedOrZero(t); }},
    {"instruments",        "",          [](TMeasure& m, TParser, TText t) { m.EncounteredMeasure.mInstruments = UnsignedOrZero(t); }},
    {"clef",               "",          Begin<&TMeasure::EncounteredClef>},
    {"sign",               "clef",      [](TMeasure& m, TParser, TText t) { m.EncounteredClef.mSign = MuxmlValueOf(t, TMuxmlEnum_ClefSign_None); }},
    {"line",               "clef",      [](TMeasure& m, TParser, TText t) { m.EncounteredClef.mStaffLine = ReadInteger(t); }},
    {"clef-octave-change", "clef",      [](TMeasure& m, TParser, TText t) { m.EncounteredClef.mClefOctaveChange = ReadInteger(t); }},
    {"transpose",          "",          Begin<&TMeasure::EncounteredTranspose>},
    {"diatonic",           "transpose", [](TMeasure& m, TParser, TText t) { m.EncounteredTranspose.mDiatonic = ReadInteger(t); }},
    {"chromatic",          "transpose", [](TMeasure& m, TParser, TText t) { m.EncounteredTranspose.mChromatic = std::round(muxml::ReadFloat(t)); }},
    {"octave-change",      "transpose", [](TMeasure& m, TParser, TText t) { m.EncounteredTranspose.mOctaveChange = ReadInteger(t); }},
    {"double",             "transpose", [](TMeasure& m, TParser, TText) { m.EncounteredTranspose.mDouble = true; }},
}));
// clang-format on
static_assert(kElementsEverywhere.HasNoNameTwice() && kElementsOutsideTime.HasNoNameTwice());

}  // namespace

void TMeasure::FoundInAttributes(XmlStreamParser& parser, std::string_view text) {
    const auto read = [&](const CAttributesRow* row) {
        if (row == nullptr || (!row->mInside.empty() && !IsInside(row->mInside))) return false;
        row->mRead(*this, parser, text);
        return true;
    };
    if (read(kElementsEverywhere.Find(currentElementName))) return;
    if (IsInside("time")) {
        EncounteredSignTime.SetElementFromString(currentElementName, text);
    } else {
        read(kElementsOutsideTime.Find(currentElementName));
    }
}

void TMeasure::FoundDivisions(XmlStreamParser& parser, std::string_view text) {
    if (text.empty()) return;
    if (ReadInteger(text) < 1) {
        parseErrorOccurred(
            parser,
            {kBadDivisions, "MusicXML File contains zero or negative value for “divisions”", 0, 0});
    }
    const auto divisions = UnsignedOrZero(text);
    EncounteredMeasure.mDivisions = divisions;
    Context().CurrentDivisionsPQN = divisions;
}

void TMeasure::encounteredSignTime() {
    EncounteredSignTime.mPositionAsMidiTicks = Context().CurrentPosAsMidiTicks;
    Context().CurrentSignTime = EncounteredSignTime;
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterSignTime>(EncounteredSignTime);
}

const std::optional<CMuxmlTranspose>& TMeasure::FirstTransposeOfMeasure() {
    if (std::exchange(mHasLookedForTranspose, true)) return mFirstTranspose;
    const XmlNode measure = Context().CurrentPartMeasureXML();
    const auto isInAttributes = [&measure](const XmlNode& node) {
        XmlNode around = node.parent();
        while (around && around != measure && around.name() != "attributes") {
            around = around.parent();
        }
        return around && around != measure;
    };
    for (XmlNode node = measure.firstChild(); node; node = node.nextBelow(measure)) {
        if (node.name() == "transpose" && isInAttributes(node)) {
            mFirstTranspose.emplace().ReadFromXMLElement(node);
            break;
        }
    }
    return mFirstTranspose;
}

void TMeasure::encounteredSignKey() {
    EncounteredSignKey.mPositionAsMidiTicks = Context().CurrentPosAsMidiTicks;
    // A key often stands before the transposition of the same attributes.
    if (Context().CurrentTranspose.mHasBeenReadFromXML) {
        EncounteredSignKey.mPartTransposeAtSignKey = Context().CurrentTranspose;
    } else if (const auto& transpose = FirstTransposeOfMeasure()) {
        EncounteredSignKey.mPartTransposeAtSignKey = *transpose;
    }
    Context().CurrentSignKey = EncounteredSignKey;
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterSignKey>(EncounteredSignKey);
}

void TMeasure::encounteredClef() {
    EncounteredClef.mPositionAsMidiTicks = Context().CurrentPosAsMidiTicks;
    EncounteredClef.mStaffDetailsXML = mFirstStaffDetails;
    Context().CurrentClef = EncounteredClef;
    std::vector<CMuxmlClef>& clefs = Context().CurrentPartGatheredInfo()->mClefs;
    if (clefs.size() < kMuxmlMaxClefs) clefs.push_back(EncounteredClef);
    // Kept: the host is asked for the method of keys.
    if (HostRespondsTo<&brindle::MusicXmlParserDelegate::didEncounterSignKey>()) {
        TellHost<&brindle::MusicXmlParserDelegate::didEncounterClef>(EncounteredClef);
    }
}

void TMeasure::encounteredTranspose() {
    EncounteredTranspose.mPositionAsMidiTicks = Context().CurrentPosAsMidiTicks;
    Context().CurrentTranspose = EncounteredTranspose;
    Context().CurrentPartGatheredInfo()->mFoundTransposeNoteCounts.Add(EncounteredTranspose, 0);
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterTranspose>(EncounteredTranspose);
}

}  // namespace brindle
