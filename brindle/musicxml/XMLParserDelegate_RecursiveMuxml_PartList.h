// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml.h"

namespace brindle {

/// Stands at the list of parts and keeps its texts to itself. What the list says is read from the
/// tree when a part starts.
class XMLParserDelegate_RecursiveMuxml_PartList final : public XMLParserDelegate_RecursiveMuxml {
protected:
    /// Drops the text.
    void foundTrimmedCharacters(XmlStreamParser&, std::string_view) override {}
};

}  // namespace brindle
