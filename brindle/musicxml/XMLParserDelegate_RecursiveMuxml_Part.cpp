// SPDX-License-Identifier: MIT
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Part.h"

#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Measure.h"
#include "brindle/musicxml/internal/CScoreIndex.h"

#include <algorithm>

namespace brindle {

void XMLParserDelegate_RecursiveMuxml_Part::didStartMyElement(XmlStreamParser&, std::string_view,
                                                              const XmlAttributes& attributes) {
    encounteredPartStart(attributes);
}

void XMLParserDelegate_RecursiveMuxml_Part::didStartElement(XmlStreamParser& parser,
                                                            std::string_view name,
                                                            const XmlAttributes& attributes) {
    EnterElement(name, attributes);
    if (name == "measure") {
        ChildDelegate = createAndSetAsDelegateForParser<XMLParserDelegate_RecursiveMuxml_Measure>(
            parser, name, attributes, *this);
        return;
    }
    PushCurrentElementName();
    if (name == "midi-device") visit_Start_MidiDevice();
    if (name == "score-part") visit_Start_ScorePart(attributes.Value("id"));
}

void XMLParserDelegate_RecursiveMuxml_Part::didEndInnerElement(std::string_view name) {
    if (name == "midi-instrument") visit_End_MidiInstrument();
    if (name == "score-part") visit_End_ScorePart();
    if (name == "score-instrument") visit_End_ScoreInstrument();
}

void XMLParserDelegate_RecursiveMuxml_Part::encounteredPartStart(const XmlAttributes& attributes) {
    _encounteredPartStart_setRootDelegateMusicXMLContext(attributes);
    _tellSignTimeBeforeFirstMeasure();
    CMuxmlPart part;
    _encounteredPartStart_setupEncounteredPart(part);
    _encounteredPartStart_queryScoreToSetMembersOf(part);
    _encounteredPartStart_queryScoreInstrumentToSetMembersOf(part);
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterPartStart>(part);
}

void XMLParserDelegate_RecursiveMuxml_Part::_encounteredPartStart_setRootDelegateMusicXMLContext(
    const XmlAttributes& attributes) {
    MusicXmlContext& context = Context();
    context.resetCurrentPartMembers();
    CurrentPartID = attributes.Value("id");
    context.CurrentDivisionsPQN = 1;
    context.CurrentPartXML = Index().TakePart(CurrentPartID);
    if (!context.CurrentPartXML) return;
    context.UpdateCurrentDivisionsPQNFromXmlElement(context.CurrentPartXML);
    context.CurrentPartMeasuresXMLs = context.CurrentPartXML.descendants("measure");
}

// The host always has a time signature before the first bar: the one of the first measure, else
// 4/4.
void XMLParserDelegate_RecursiveMuxml_Part::_tellSignTimeBeforeFirstMeasure() {
    MusicXmlContext& context = Context();
    const std::vector<XmlNode>& measures = context.CurrentPartMeasuresXMLs;
    if (!measures.empty() && measures.front().firstDescendant("time")) {
        context.CurrentSignTime.mPrintObject = TMuxmlEnum_YesNo_Yes;
        return;
    }
    context.CurrentSignTime.mPrintObject = TMuxmlEnum_YesNo_No;
    context.CurrentSignTime.mPositionAsMidiTicks = context.CurrentPosAsMidiTicks;
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterSignTime>(context.CurrentSignTime);
}

void XMLParserDelegate_RecursiveMuxml_Part::_encounteredPartStart_setupEncounteredPart(
    CMuxmlPart& part) const {
    part.mPartXML = Context().CurrentPartXML;
    part.mPositionAsMidiTicks = Context().CurrentPosAsMidiTicks;
    part.mID = CurrentPartID;
    part.mInstrumentCount = static_cast<std::int32_t>(ScoreInstruments.count(CurrentPartID));
}

void XMLParserDelegate_RecursiveMuxml_Part::_encounteredPartStart_queryScoreToSetMembersOf(
    CMuxmlPart& part) const {
    const XmlNode scorePart = Index().ScorePart(CurrentPartID);
    const auto textOf = [&](std::string_view name) {
        return scorePart.firstDescendant(name).stringValue();
    };
    part.mPartName = textOf("part-name");
    part.mPartNameDisplay = textOf("part-name-display");
    part.mPartAbbreviation = textOf("part-abbreviation");
    part.mPartAbbreviationDisplay = textOf("part-abbreviation-display");
}

void XMLParserDelegate_RecursiveMuxml_Part::
    _encounteredPartStart_queryScoreInstrumentToSetMembersOf(CMuxmlPart& part) const {
    part.mScoreInstruments = Index().TakeInstruments(CurrentPartID);
    part.mHasStringInstrument = std::any_of(
        part.mScoreInstruments.begin(), part.mScoreInstruments.end(),
        [](const CMuxmlScoreInstrument& entry) { return entry.InstSoundGroupIsStrings(); });
}

void XMLParserDelegate_RecursiveMuxml_Part::encounteredPartEnd() {
    MusicXmlContext& context = Context();
    for (const CMuxmlNote& note : context.PlayedTies.NotesLeftOpen()) {
        TellHost<&brindle::MusicXmlParserDelegate::didPlayNote>(note);
        TellHost<&brindle::MusicXmlParserDelegate::didLeaveTieOpen>(note);
    }
    context.CurrentPartGatheredInfo()->mPartEndPosAsMidiTicks = context.CurrentPosAsMidiTicks;
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterPartEnd>(
        context.mCurrentPartGatheredInfo);
    context.resetCurrentPartMembers();
}

}  // namespace brindle
