// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Child.h"

namespace brindle {

/// Reads the tempo of a `sound`.
class XMLParserDelegate_RecursiveMuxml_Sound final : public XMLParserDelegate_RecursiveMuxml_Child {
public:
    void didStartMyElement(XmlStreamParser& parser, std::string_view name,
                           const XmlAttributes& attributes) override;

    /// Tells the host a tempo, quarters a minute, at the current position.
    void encounteredTempoChange(float tempo);
};

}  // namespace brindle
