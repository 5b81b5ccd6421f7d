// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlPart.h"
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Child.h"

#include <map>
#include <string>

namespace brindle {

/// Reads a `part` and hands its measures to their delegates.
class XMLParserDelegate_RecursiveMuxml_Part final : public XMLParserDelegate_RecursiveMuxml_Child {
public:
    std::string CurrentPartID;  ///< the attribute `id` of the part, "P1"
    /// By the identifier of their part. Nothing fills them.
    std::multimap<std::string, CMuxmlScoreInstrument> ScoreInstruments;
    std::multimap<std::string, CMuxmlScoreInstrument> MidiInstruments;  ///< likewise

    void didStartMyElement(XmlStreamParser& parser, std::string_view name,
                           const XmlAttributes& attributes) override;
    void didStartElement(XmlStreamParser& parser, std::string_view name,
                         const XmlAttributes& attributes) override;

    /// Begins the part anew at position 0, and tells the host its time signature if its first
    /// measure has none, then its names and instruments.
    void encounteredPartStart(const XmlAttributes& attributes);
    /// Tells the host the notes whose ties are open, and what was learned about the part.
    void encounteredPartEnd();

protected:
    void didEndMyElement() override { encounteredPartEnd(); }
    void didEndInnerElement(std::string_view name) override;
    /// Keeps the text to itself.
    void foundTrimmedCharacters(XmlStreamParser&, std::string_view) override {}

private:
    void _encounteredPartStart_setRootDelegateMusicXMLContext(const XmlAttributes& attributes);
    void _tellSignTimeBeforeFirstMeasure();
    void _encounteredPartStart_setupEncounteredPart(CMuxmlPart& part) const;
    void _encounteredPartStart_queryScoreToSetMembersOf(CMuxmlPart& part) const;
    void _encounteredPartStart_queryScoreInstrumentToSetMembersOf(CMuxmlPart& part) const;

    void visit_Start_MidiDevice() {}
    void visit_Start_ScorePart(std::string_view id) { CurrentPartID = id; }
    void visit_End_MidiInstrument() {}
    void visit_End_ScorePart() { CurrentPartID.clear(); }
    void visit_End_ScoreInstrument() {}
};

}  // namespace brindle
