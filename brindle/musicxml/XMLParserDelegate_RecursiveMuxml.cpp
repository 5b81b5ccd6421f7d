// SPDX-License-Identifier: MIT
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml.h"

#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_Part.h"
#include "brindle/musicxml/XMLParserDelegate_RecursiveMuxml_PartList.h"
#include "brindle/musicxml/internal/CScoreIndex.h"
#include "brindle/platform/Alerts.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/Localization.h"

#include <algorithm>
#include <array>

namespace brindle {

namespace {

// The format with its places "%zd" and "%@" filled in their order.
std::string Filled(const std::string& format, const std::vector<std::string>& values) {
    std::string text;
    std::size_t begin = 0;
    for (const std::string& value : values) {
        const std::size_t place = format.find('%', begin);
        if (place == format.npos) break;
        text.append(format, begin, place - begin);
        text += value;
        begin = place + (format.compare(place, 2, "%@") == 0 ? 2 : 3);
    }
    return begin < format.size() ? text.append(format, begin, format.npos) : text;
}

}  // namespace

XMLParserDelegate_RecursiveMuxml::XMLParserDelegate_RecursiveMuxml() = default;
XMLParserDelegate_RecursiveMuxml::~XMLParserDelegate_RecursiveMuxml() = default;

XMLParserDelegate_RecursiveMuxml::XMLParserDelegate_RecursiveMuxml(std::int32_t midiTicksPerQuarter,
                                                                   const XmlDocument& document)
    : RootDelegate(this),
      musicXmlContext(std::make_unique<MusicXmlContext>(midiTicksPerQuarter)),
      wholeDocumentXML(std::make_unique<XmlDocument>(document)),
      mIndex(std::make_unique<muxml::CScoreIndex>(document.rootElement())) {
    partListXML = mIndex->PartList();
}

void XMLParserDelegate_RecursiveMuxml::initAndSetAsDelegateForParser(
    XmlStreamParser& parser, std::string_view elementName, const XmlAttributes& attributes,
    XMLParserDelegate_RecursiveMuxml& parentDelegate) {
    parser.setDelegate(this);
    ParentDelegate = &parentDelegate;
    RootDelegate = parentDelegate.RootDelegate;
    MyRecursiveTreeStartsAtElementName = elementName;
    Trace = parentDelegate.Trace;
    didStartMyElement(parser, elementName, attributes);
}

void XMLParserDelegate_RecursiveMuxml::didStartMyElement(XmlStreamParser&, std::string_view,
                                                         const XmlAttributes&) {}

void XMLParserDelegate_RecursiveMuxml::didStartDocument(XmlStreamParser&) {
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterDocumentStartWithProgressBarInfo>(
        TMuxmlProgressBarInfo{getScorePartCountFromXMLDocument()});
}

void XMLParserDelegate_RecursiveMuxml::didEndDocument(XmlStreamParser&) {
    TellHost<&brindle::MusicXmlParserDelegate::didEncounterDocumentEnd>();
}

std::int32_t XMLParserDelegate_RecursiveMuxml::getScorePartCountFromXMLDocument() const {
    return Index().ScorePartCount();
}

void XMLParserDelegate_RecursiveMuxml::didStartElement(XmlStreamParser& parser,
                                                       std::string_view name,
                                                       const XmlAttributes& attributes) {
    EnterElement(name, attributes);
    if (name == "identification") return;
    if (name == "part-list") {
        ChildDelegate = createAndSetAsDelegateForParser<XMLParserDelegate_RecursiveMuxml_PartList>(
            parser, name, attributes, *this);
    } else if (name == "part") {
        ChildDelegate = createAndSetAsDelegateForParser<XMLParserDelegate_RecursiveMuxml_Part>(
            parser, name, attributes, *this);
    } else {
        PushCurrentElementName();
    }
}

void XMLParserDelegate_RecursiveMuxml::didEndElement(XmlStreamParser& parser,
                                                     std::string_view name) {
    didEndElement_resetCurrentElementNameAndRemoveFromCurrentElementParentNames(name);
    if (name != "part-list" && name != "part") return;
    // Kept: a part inside a part ends the outer one, whose own end then leaves the parser without
    // a delegate.
    parser.setDelegate(ParentDelegate);
    if (ParentDelegate != nullptr) ParentDelegate->ChildDelegate.reset();
}

void XMLParserDelegate_RecursiveMuxml::foundCharacters(XmlStreamParser& parser,
                                                       std::string_view text) {
    if (!text.starts_with('\n')) foundTrimmedCharacters(parser, Ascii::Trimmed(text));
}

void XMLParserDelegate_RecursiveMuxml::foundTrimmedCharacters(XmlStreamParser& parser,
                                                              std::string_view text) {
    if (ParentDelegate != nullptr) ParentDelegate->foundCharacters(parser, text);
}

void XMLParserDelegate_RecursiveMuxml::parseErrorOccurred(XmlStreamParser& parser,
                                                          const XmlError& error) {
    _ShowAlert(parser, error, "MusicXML Parsing Error",
               "Parsing error %zd, Description: %@, Line: %zd, Column: %zd");
}

void XMLParserDelegate_RecursiveMuxml::validationErrorOccurred(XmlStreamParser& parser,
                                                               const XmlError& error) {
    _ShowAlert(parser, error, "MusicXML Validation Error",
               "Validation error %zd, Description: %@, Line: %zd, Column: %zd");
}

void XMLParserDelegate_RecursiveMuxml::_ShowAlert(XmlStreamParser& parser, const XmlError& error,
                                                  const char* messageText, const char* format) {
    if (++RootDelegate->mAlertCount > kMuxmlMaxAlerts) return;
    ShowAlert({LocalizedString(messageText),
               Filled(LocalizedString(format),
                      {std::to_string(error.mCode), error.mDescription,
                       std::to_string(parser.lineNumber()), std::to_string(parser.columnNumber())}),
               LocalizedString("OK")});
}

void XMLParserDelegate_RecursiveMuxml::setParserDelegateToParentDelegateAndReleaseSelf(
    std::string_view name, XmlStreamParser& parser) {
    XMLParserDelegate_RecursiveMuxml* const parent = ParentDelegate;
    parser.setDelegate(parent);
    parent->didEndElement_resetCurrentElementNameAndRemoveFromCurrentElementParentNames(name);
    parent->ChildDelegate.reset();
}

void XMLParserDelegate_RecursiveMuxml::
    didEndElement_resetCurrentElementNameAndRemoveFromCurrentElementParentNames(
        std::string_view name) {
    currentElementName.clear();
    currentAttributes.Clear();
    if (!currentElementParentNames.empty() && currentElementParentNames.back() == name) {
        currentElementParentNames.pop_back();
    }
}

void XMLParserDelegate_RecursiveMuxml::EnterElement(std::string_view name,
                                                    const XmlAttributes& attributes) {
    currentAttributes.Assign(attributes);
    currentElementName = name;
}

bool XMLParserDelegate_RecursiveMuxml::IsInside(std::string_view name) const {
    return std::find(currentElementParentNames.begin(), currentElementParentNames.end(), name) !=
           currentElementParentNames.end();
}

}  // namespace brindle
