// SPDX-License-Identifier: MIT
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Measure.h"

#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Note.h"
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Sound.h"
#include "brindle/musicxml/internal/CScoreIndex.h"
#include "brindle/musicxml/internal/ReadMuxml.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <utility>

namespace brindle {

namespace {

using TMeasure = XMLParserDelegate_RecursiveMuxml_Measure;

std::int32_t IntegerOrZeroIfBelowOne(std::string_view text) {
    return std::max(0, ReadInteger(text));
}

// The code that a host sees in the alert about divisions.
constexpr int kBadDivisions = 1;

}  // namespace

// Element, the element around it, what is done with its text. Inside `attributes` only. The first
// row that fits counts; a row without a name fits all elements. Each is done with the empty text at
// the start of the element, and once more if there is a text.
struct XMLParserDelegate_RecursiveMuxml_Measure::TAttributesRow {
    std::string_view mElement;
    std::string_view mInside;
    void (*mRead)(TMeasure& measure, XmlStreamParser& parser, std::string_view text);
};

const TMeasure::TAttributesRow* TMeasure::FindAttributesRow(const TMeasure& self) {
    using Parser = XmlStreamParser&;
    using Text = std::string_view;
    // clang-format off
    static constexpr auto kRows = std::to_array<TAttributesRow>({
        {"divisions", "", [](TMeasure& m, Parser p, Text text) { m.FoundDivisions(p, text); }},

        {"key", "", [](TMeasure& m, Parser, Text) {
            m.EncounteredSignKey = {};
            m.EncounteredSignKey.ReadFromAttributes(m.currentAttributes);
        }},
        {"fifths", "key", [](TMeasure& m, Parser, Text text) {
            m.EncounteredSignKey.mFifths = ReadInteger(text);
        }},
        {"mode", "key", [](TMeasure& m, Parser, Text text) {
            m.EncounteredSignKey.mMode = MuxmlValueOf(text, TMuxmlEnum_SignKeyMode_Major);
        }},

        {"time", "", [](TMeasure& m, Parser, Text) {
            m.EncounteredSignTime = {};
            m.EncounteredSignTime.ReadFromAttributes(m.currentAttributes);
        }},
        {"", "time", [](TMeasure& m, Parser, Text text) {
            m.EncounteredSignTime.SetElementFromString(m.currentElementName, text);
        }},

        {"staves", "", [](TMeasure& m, Parser, Text text) {
            m.EncounteredMeasure.mStaves =
                static_cast<std::uint64_t>(IntegerOrZeroIfBelowOne(text));
        }},
        {"part-symbol", "", [](TMeasure&, Parser, Text) {}},
        {"instruments", "", [](TMeasure& m, Parser, Text text) {
            m.EncounteredMeasure.mInstruments =
                static_cast<std::uint64_t>(IntegerOrZeroIfBelowOne(text));
        }},

        {"clef", "", [](TMeasure& m, Parser, Text) {
            m.EncounteredClef = {};
            m.EncounteredClef.ReadFromAttributes(m.currentAttributes);
        }},
        {"sign", "clef", [](TMeasure& m, Parser, Text text) {
            m.EncounteredClef.mSign = MuxmlValueOf(text, TMuxmlEnum_ClefSign_None);
        }},
        {"line", "clef", [](TMeasure& m, Parser, Text text) {
            m.EncounteredClef.mStaffLine = ReadInteger(text);
        }},
        {"clef-octave-change", "clef", [](TMeasure& m, Parser, Text text) {
            m.EncounteredClef.mClefOctaveChange = ReadInteger(text);
        }},

        {"transpose", "", [](TMeasure& m, Parser, Text) {
            m.EncounteredTranspose = {};
            m.EncounteredTranspose.ReadFromAttributes(m.currentAttributes);
        }},
        {"diatonic", "transpose", [](TMeasure& m, Parser, Text text) {
            m.EncounteredTranspose.mDiatonic = ReadInteger(text);
        }},
        {"chromatic", "transpose", [](TMeasure& m, Parser, Text text) {
            m.EncounteredTranspose.mChromatic = std::round(muxml::ReadFloat(text));
        }},
        {"octave-change", "transpose", [](TMeasure& m, Parser, Text text) {
            m.EncounteredTranspose.mOctaveChange = ReadInteger(text);
        }},
        {"double", "transpose", [](TMeasure& m, Parser, Text) {
            m.EncounteredTranspose.mDouble = true;
        }},

        {"directive", "", [](TMeasure&, Parser, Text) {}},
        {"measure-style", "", [](TMeasure&, Parser, Text) {}},
    });
    // clang-format on
    const auto* const row =
        std::find_if(kRows.begin(), kRows.end(), [&self](const TAttributesRow& entry) {
            const bool fits = entry.mElement.empty() || entry.mElement == self.currentElementName;
            return fits && (entry.mInside.empty() || self.IsInside(entry.mInside));
        });
    return row == kRows.end() ? nullptr : row;
}

void TMeasure::didStartMyElement(XmlStreamParser&, std::string_view name,
                                 const XmlAttributes& attributes) {
    EncounteredMeasure = {};
    Context().CurrentMeasure = {};
    encounteredMeasureStart(attributes);
    currentElementName = name;
    PushCurrentElementName();
}

void TMeasure::didStartElement(XmlStreamParser& parser, std::string_view name,
                               const XmlAttributes& attributes) {
    EnterElement(name, attributes);
    if (name == "note") {
        ChildDelegate = createAndSetAsDelegateForParser<XMLParserDelegate_RecursiveMuxml_Note>(
            parser, name, attributes, *this);
    } else if (name == "sound") {
        ChildDelegate = createAndSetAsDelegateForParser<XMLParserDelegate_RecursiveMuxml_Sound>(
            parser, name, attributes, *this);
    } else if (name == "forward") {
        Context().InXMLElementForward = true;
    } else if (name == "backup") {
        Context().InXMLElementBackup = true;
    } else if (name == "senza-misura") {
        EncounteredSignTime.mSenzaMisura = true;
    } else if (name == "direction") {
        encounteredDirection();
    } else {
        PushCurrentElementName();
    }
    foundCharacters(parser, "");
}

void TMeasure::didEndElement(XmlStreamParser& parser, std::string_view name) {
    if (name == MyRecursiveTreeStartsAtElementName) {
        encounteredMeasureEnd();
        didEndElement_resetCurrentElementNameAndRemoveFromCurrentElementParentNames(name);
        setParserDelegateToParentDelegateAndReleaseSelf(name, parser);
        return;
    }
    if (name == "time") {
        encounteredSignTime();
    } else if (name == "key") {
        encounteredSignKey();
    } else if (name == "clef") {
        encounteredClef();
    } else if (name == "transpose") {
        encounteredTranspose();
    } else if (name == "forward") {
        Context().InXMLElementForward = false;
    } else if (name == "backup") {
        Context().InXMLElementBackup = false;
    }
    didEndElement_resetCurrentElementNameAndRemoveFromCurrentElementParentNames(name);
}

void TMeasure::foundTrimmedCharacters(XmlStreamParser& parser, std::string_view text) {
    if (currentElementName == "measure") return;
    if (!IsInside("measure")) {
        ParentDelegate->foundCharacters(parser, text);
    } else if (IsInside("attributes")) {
        if (const TAttributesRow* row = FindAttributesRow(*this)) row->mRead(*this, parser, text);
    } else if (currentElementName == "duration") {
        FoundDuration(text);
    }
}

void TMeasure::parseErrorOccurred(XmlStreamParser& parser, const XmlError& error) {
    ParentDelegate->parseErrorOccurred(parser, error);
}

void TMeasure::FoundDivisions(XmlStreamParser& parser, std::string_view text) {
    if (text.empty()) return;
    if (ReadInteger(text) < 1) {
        parseErrorOccurred(
            parser,
            {kBadDivisions, "MusicXML File contains zero or negative value for “divisions”", 0, 0});
    }
    const auto divisions = static_cast<std::uint64_t>(IntegerOrZeroIfBelowOne(text));
    EncounteredMeasure.mDivisions = divisions;
    Context().CurrentDivisionsPQN = divisions;
}

void TMeasure::FoundDuration(std::string_view text) {
    MusicXmlContext& context = Context();
    const std::int32_t duration = IntegerOrZeroIfBelowOne(text);
    const std::int32_t ticks = context.ConvertMuxmlDurationToMidiTicks(duration);
    // Kept: the place in the bar grows on a backup, too.
    if (context.InXMLElementBackup) {
        context.AdvanceCurrentPosByMidiTicks(muxml::WrappedDifference(0, ticks), duration);
    }
    if (context.InXMLElementForward) context.AdvanceCurrentPosByMidiTicks(ticks, duration);
}

// Notes, directions and the rest in one walk over the measure.
void TMeasure::FindElementsOfMeasure() {
    MusicXmlContext& context = Context();
    context.CurrentPartMeasureNotesXMLIx = -1;
    context.CurrentPartMeasureNotesXMLs.clear();
    context.CurrentPartMeasureDirectionsXMLIx = -1;
    context.CurrentPartMeasureDirectionsXMLs.clear();
    const XmlNode measure = context.CurrentPartMeasureXML();
    for (XmlNode node = measure.firstChild(); node; node = node.nextBelow(measure)) {
        const std::string_view name = node.name();
        if (name == "note") {
            context.CurrentPartMeasureNotesXMLs.push_back(node);
        } else if (name == "direction") {
            context.CurrentPartMeasureDirectionsXMLs.push_back(node);
        } else if (name == "barline") {
            mBarlines.push_back(node);
        } else if (name == "staff-details" && !mFirstStaffDetails) {
            mFirstStaffDetails = node;
        }
    }
}

void TMeasure::encounteredMeasureStart(const XmlAttributes& attributes) {
    MusicXmlContext& context = Context();
    ++context.CurrentPartMeasuresXMLIx;
    FindElementsOfMeasure();
    _encounteredMeasureStart_detectIncompleteFirstBar();
    context.CurrentBarStartAsMidiTicks = context.CurrentPosAsMidiTicks;
    // Kept: what an incomplete first bar lacks shifts the places in all bars of the part.
    context.CurrentPosInBarAsDuration = context.ShiftNotePosInIncompleteFirstBarAsDuration;
    EncounteredMeasure.mPositionAsMidiTicks = context.CurrentBarStartAsMidiTicks;
    CMuxmlAttributes measureAttributes;
    measureAttributes.Assign(attributes);
    EncounteredMeasure.ReadFromAttributes(measureAttributes);
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterMeasureStart>(
        context.CurrentBarStartAsMidiTicks);
}

void TMeasure::_encounteredMeasureStart_detectIncompleteFirstBar() {
    MusicXmlContext& context = Context();
    if (context.CurrentPartMeasuresXMLIx != 0) return;
    const std::int32_t full =
        _encounteredMeasureStart_detectIncompleteFirstBar_barLengthOfFirstSignTimeAsDuration();
    context.ShiftNotePosInIncompleteFirstBarAsDuration =
        std::max(0, muxml::WrappedDifference(full, _findMaxPosInCurrentPartMeasureAsDuration()));
}

// Kept: the first time signature of the document counts for all parts.
std::int32_t
TMeasure::_encounteredMeasureStart_detectIncompleteFirstBar_barLengthOfFirstSignTimeAsDuration() {
    MusicXmlContext& context = Context();
    CMuxmlSignTime signTime;
    if (const XmlNode measure = context.CurrentPartMeasureXML()) {
        context.UpdateCurrentDivisionsPQNFromXmlElement(measure);
        signTime = Index().FirstSignTime();
    }
    return muxml::WrappedInteger(static_cast<double>(context.CurrentDivisionsPQN) * 4.0 *
                                 signTime.mNomAkaBeats / signTime.mDenomAkaBeatTypeAsInt);
}

// Kept: the place at the end and not the greatest one. In a document with chords no note counts.
std::int32_t TMeasure::_findMaxPosInCurrentPartMeasureAsDuration() const {
    std::int32_t sum = 0;
    const XmlNode measure = Context().CurrentPartMeasureXML();
    for (XmlNode child = measure.firstChild(); child; child = child.nextSibling()) {
        const std::int32_t duration = ReadInteger(child.child("duration").stringValue());
        const std::string_view name = child.name();
        if (name == "forward" || (name == "note" && !Index().HasChord())) {
            sum = muxml::WrappedSum(sum, duration);
        } else if (name == "backup") {
            sum = muxml::WrappedDifference(sum, duration);
        }
    }
    return sum;
}

std::int32_t TMeasure::_NextBarStart() const {
    const MusicXmlContext& context = Context();
    const std::int32_t beats = context.CurrentSignTime.mNomAkaBeats;
    const std::int32_t beatType = context.CurrentSignTime.mDenomAkaBeatTypeAsInt;
    if (beats == 0 || beatType == 0) return 0;
    const std::int32_t beat =
        muxml::WrappedInteger(static_cast<double>(context.TicksPerQuarter) * 4.0 / beatType);
    return muxml::WrappedSum(context.CurrentBarStartAsMidiTicks,
                             muxml::WrappedProduct(beats, beat));
}

void TMeasure::encounteredMeasureEnd() {
    MusicXmlContext& context = Context();
    context.CurrentPosAsMidiTicks = _NextBarStart();
    context.CurrentPosInBarAsDuration = 0;
    EncounteredMeasure.mEndPositionAsMidiTicks = context.CurrentPosAsMidiTicks;
    context.CurrentMeasure = EncounteredMeasure;
    CPositionedInfo<std::int32_t>& staves = context.CurrentPartGatheredInfo()->mPositionedStaves;
    const auto staffCount = static_cast<std::int32_t>(EncounteredMeasure.mStaves);
    if (staves.empty() || staves.back().second != staffCount) {
        staves.emplace_back(EncounteredMeasure.mPositionAsMidiTicks, staffCount);
    }
    EncounteredMeasure.mMeasureXML = context.CurrentPartMeasureXML();
    EncounteredMeasure.mBarlineXMLs = mBarlines;
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterMeasureEnd>(EncounteredMeasure);
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

void TMeasure::encounteredDirection() {
    MusicXmlContext& context = Context();
    ++context.CurrentPartMeasureDirectionsXMLIx;
    const XmlNode element = context.CurrentPartMeasureDirectionXML();
    if (!element) return;
    const CPositionedXMLElement direction(context.CurrentPosAsMidiTicks, element,
                                          context.CurrentDivisionsPQN);
    context.VelocityFromDynamics.Update(direction);
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterDirection>(direction);
}

}  // namespace brindle
