// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml.h"

namespace brindle {

/// Reads the tempo of a `sound`.
class XMLParserDelegate_RecursiveMuxml_Sound final : public XMLParserDelegate_RecursiveMuxml {
public:
    void didStartMyElement(XmlStreamParser& parser, std::string_view name,
                           const XmlAttributes& attributes) override;
    void didStartElement(XmlStreamParser& parser, std::string_view name,
                         const XmlAttributes& attributes) override;
    void didEndElement(XmlStreamParser& parser, std::string_view name) override;
    void parseErrorOccurred(XmlStreamParser& parser, const XmlError& error) override;

    void encounteredTempoChange(float tempo);
};

}  // namespace brindle
