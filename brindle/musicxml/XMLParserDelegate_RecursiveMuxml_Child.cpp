// SPDX-License-Identifier: MIT
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Child.h"

namespace brindle {

void XMLParserDelegate_RecursiveMuxml_Child::didStartElement(XmlStreamParser& parser,
                                                             std::string_view name,
                                                             const XmlAttributes& attributes) {
    EnterElement(name, attributes);
    PushCurrentElementName();
    foundCharacters(parser, "");
}

void XMLParserDelegate_RecursiveMuxml_Child::didEndElement(XmlStreamParser& parser,
                                                           std::string_view name) {
    const bool isMyEnd = name == MyRecursiveTreeStartsAtElementName;
    if (isMyEnd) {
        didEndMyElement();
    } else {
        didEndInnerElement(name);
    }
    didEndElement_resetCurrentElementNameAndRemoveFromCurrentElementParentNames(name);
    if (isMyEnd) setParserDelegateToParentDelegateAndReleaseSelf(name, parser);
}

void XMLParserDelegate_RecursiveMuxml_Child::parseErrorOccurred(XmlStreamParser& parser,
                                                                const XmlError& error) {
    ParentDelegate->parseErrorOccurred(parser, error);
}

}  // namespace brindle
