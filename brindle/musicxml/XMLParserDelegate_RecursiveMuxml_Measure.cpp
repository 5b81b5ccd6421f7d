// SPDX-License-Identifier: MIT
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Measure.h"

#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Note.h"
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Sound.h"
#include "brindle/musicxml/internal/CScoreIndex.h"
#include "brindle/musicxml/internal/ReadMuxml.h"

#include <algorithm>

namespace brindle {

namespace {

using TMeasure = XMLParserDelegate_RecursiveMuxml_Measure;

}  // namespace

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

void TMeasure::didEndInnerElement(std::string_view name) {
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
}

void TMeasure::foundTrimmedCharacters(XmlStreamParser& parser, std::string_view text) {
    if (currentElementName == "measure") return;
    if (!IsInside("measure")) {
        ParentDelegate->foundCharacters(parser, text);
    } else if (IsInside("attributes")) {
        FoundInAttributes(parser, text);
    } else if (currentElementName == "duration") {
        FoundDuration(text);
    }
}

void TMeasure::FoundDuration(std::string_view text) {
    MusicXmlContext& context = Context();
    const std::int32_t duration = std::max(0, ReadInteger(text));
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
