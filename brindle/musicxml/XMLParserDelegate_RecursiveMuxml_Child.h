// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml.h"

namespace brindle {

/// A delegate below the root: what all of them do alike at the elements inside their own and at its
/// end. Virtual like its base: each kind says what it does at these places.
class XMLParserDelegate_RecursiveMuxml_Child : public XMLParserDelegate_RecursiveMuxml {
public:
    /// Calls foundCharacters with the empty text, so that the element is noticed even without one.
    void didStartElement(XmlStreamParser& parser, std::string_view name,
                         const XmlAttributes& attributes) override;
    /// Gives the parser back at the end of the delegate's own element.
    void didEndElement(XmlStreamParser& parser, std::string_view name) final;
    /// Leaves it to the parent, and so to the root.
    void parseErrorOccurred(XmlStreamParser& parser, const XmlError& error) final;

protected:
    /// The delegate's own element ends.
    virtual void didEndMyElement() {}
    /// An element inside it ends.
    virtual void didEndInnerElement(std::string_view /*name*/) {}
};

}  // namespace brindle
