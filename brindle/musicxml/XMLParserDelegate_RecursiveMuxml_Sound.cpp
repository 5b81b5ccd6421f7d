// SPDX-License-Identifier: MIT
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Sound.h"

#include "brindle/musicxml/internal/ReadMuxml.h"

namespace brindle {

void XMLParserDelegate_RecursiveMuxml_Sound::didStartMyElement(XmlStreamParser& parser,
                                                               std::string_view,
                                                               const XmlAttributes& attributes) {
    if (const auto tempo = attributes.Find("tempo")) {
        encounteredTempoChange(muxml::ReadFloat(*tempo));
    }
    foundCharacters(parser, "");
}

void XMLParserDelegate_RecursiveMuxml_Sound::encounteredTempoChange(float tempo) {
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterTempoChange>(
        CMuxmlTempoChange{Context().CurrentPosAsMidiTicks, tempo});
}

}  // namespace brindle
