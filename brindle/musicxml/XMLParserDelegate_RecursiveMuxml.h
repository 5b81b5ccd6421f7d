// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlAttributes.h"
#include "brindle/musicxml/MusicXmlContext.h"
#include "brindle/musicxml/MusicXmlParserDelegate.h"
#include "brindle/platform/XmlDocument.h"
#include "brindle/platform/XmlStreamParser.h"

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

namespace muxml {
class CScoreIndex;
}

/// Reads the events of a score. The grammar is split over small delegates, one class for each
/// element of interest: at the start of such an element its delegate takes the parser over, at its
/// end it gives the parser back and is destroyed. This class is the root and the base of them all,
/// virtual for that reason. The root owns what they share: the context and the document as a tree.
class XMLParserDelegate_RecursiveMuxml : public XmlStreamDelegate {
public:
    /// A delegate that is to be set up by createAndSetAsDelegateForParser.
    XMLParserDelegate_RecursiveMuxml();
    /// `initAsRootDelegateWithMidiTicksPerQuarter:andWholeDocumentXML:`
    /// The root of an import with so many ticks to the quarter; it keeps a copy of the document.
    XMLParserDelegate_RecursiveMuxml(std::int32_t midiTicksPerQuarter,
                                     const XmlDocument& wholeDocumentXML);
    /// Destroys its child, too, and the child's.
    ~XMLParserDelegate_RecursiveMuxml() override;
    /// Not copied: others hold pointers to it.
    XMLParserDelegate_RecursiveMuxml(const XMLParserDelegate_RecursiveMuxml&) = delete;
    /// Nor assigned.
    XMLParserDelegate_RecursiveMuxml& operator=(const XMLParserDelegate_RecursiveMuxml&) = delete;

    bool Trace = false;  ///< the parent's; nothing looks at it
    /// Names of the open elements below this delegate's own.
    std::vector<std::string> currentElementParentNames;
    /// The host's; only the root's is used.
    std::weak_ptr<const brindle::MusicXmlParserDelegate> MusicXmlParserDelegate;
    /// Owns this delegate; null for the root.
    XMLParserDelegate_RecursiveMuxml* ParentDelegate = nullptr;
    XMLParserDelegate_RecursiveMuxml* RootDelegate = nullptr;  ///< itself, of the root
    /// The one that has the parser now or handed it on; null at the lowest.
    std::unique_ptr<XMLParserDelegate_RecursiveMuxml> ChildDelegate;
    /// The element whose end ends this delegate.
    std::string MyRecursiveTreeStartsAtElementName;
    // Of the root only:
    std::unique_ptr<MusicXmlContext> musicXmlContext;  ///< the state that all delegates share
    std::unique_ptr<XmlDocument> wholeDocumentXML;     ///< the file as a tree, for looking ahead
    XmlNode partListXML;                               ///< the first `part-list`; empty without one
    /// The element that is open now, "" when there is none, and its attributes.
    std::string currentElementName;
    CMuxmlAttributes currentAttributes;  ///< those of that element

    /// Makes a delegate of the class for an element that starts, and makes it the parser's.
    /// `createAndSetAsDelegateForParser:elementName:namespaceURI:qualifiedName:attributes:`
    /// `parentDelegate:rootDelegate:children:`
    template <class Delegate>
    static std::unique_ptr<XMLParserDelegate_RecursiveMuxml> createAndSetAsDelegateForParser(
        XmlStreamParser& parser, std::string_view elementName, const XmlAttributes& attributes,
        XMLParserDelegate_RecursiveMuxml& parentDelegate) {
        auto delegate = std::make_unique<Delegate>();
        delegate->initAndSetAsDelegateForParser(parser, elementName, attributes, parentDelegate);
        return delegate;
    }

    /// `initAndSetAsDelegateForParser:elementName:namespaceURI:qualifiedName:attributes:`
    /// `parentDelegate:rootDelegate:children:`
    void initAndSetAsDelegateForParser(XmlStreamParser& parser, std::string_view elementName,
                                       const XmlAttributes& attributes,
                                       XMLParserDelegate_RecursiveMuxml& parentDelegate);

    /// The element that created this delegate has started.
    /// `parser:didStartMyElement:namespaceURI:qualifiedName:attributes:`
    virtual void didStartMyElement(XmlStreamParser& parser, std::string_view name,
                                   const XmlAttributes& attributes);

    /// `parserDidStartDocument:`
    void didStartDocument(XmlStreamParser& parser) override;
    /// `parserDidEndDocument:`
    void didEndDocument(XmlStreamParser& parser) override;
    /// `parser:didStartElement:namespaceURI:qualifiedName:attributes:`
    void didStartElement(XmlStreamParser& parser, std::string_view name,
                         const XmlAttributes& attributes) override;
    /// `parser:didEndElement:namespaceURI:qualifiedName:`
    void didEndElement(XmlStreamParser& parser, std::string_view name) override;
    /// `parser:foundCharacters:` Text that begins with a line feed is dropped; the rest goes
    /// without white space at its ends to foundTrimmedCharacters.
    void foundCharacters(XmlStreamParser& parser, std::string_view text) final;
    /// `parser:parseErrorOccurred:` Shows an alert.
    void parseErrorOccurred(XmlStreamParser& parser, const XmlError& error) override;
    /// `parser:validationErrorOccurred:` Shows an alert. Nothing validates scores by itself.
    void validationErrorOccurred(XmlStreamParser& parser, const XmlError& error);

    /// The number of parts in the list of a partwise score.
    [[nodiscard]] std::int32_t getScorePartCountFromXMLDocument() const;

protected:
    /// Text of the element that is open, or "" at its start. This class hands it to the parent.
    virtual void foundTrimmedCharacters(XmlStreamParser& parser, std::string_view text);

    /// Gives the parser back to the parent, which destroys this delegate: nothing may touch it
    /// afterwards.
    void setParserDelegateToParentDelegateAndReleaseSelf(std::string_view name,
                                                         XmlStreamParser& parser);
    /// Forgets the element that ends, and takes it from the open ones if it is the last of them.
    void didEndElement_resetCurrentElementNameAndRemoveFromCurrentElementParentNames(
        std::string_view name);

    /// Stores name and attributes of an element that starts.
    void EnterElement(std::string_view name, const XmlAttributes& attributes);
    /// The current element becomes one of the open ones.
    void PushCurrentElementName() { currentElementParentNames.push_back(currentElementName); }
    /// Whether an open element of this delegate has the name.
    [[nodiscard]] bool IsInside(std::string_view name) const;

    /// The state of the import, the root's.
    [[nodiscard]] MusicXmlContext& Context() const { return *RootDelegate->musicXmlContext; }
    /// What is looked up in the tree, the root's.
    [[nodiscard]] muxml::CScoreIndex& Index() const { return *RootDelegate->mIndex; }

    /// Whether the host has the method.
    template <auto Method>
    [[nodiscard]] bool HostRespondsTo() const {
        const auto host = RootDelegate->MusicXmlParserDelegate.lock();
        return host != nullptr && (*host).*Method;
    }

    /// Calls the method of the host, if it has it.
    template <auto Method, class... Arguments>
    void TellHost(const Arguments&... arguments) const {
        const auto host = RootDelegate->MusicXmlParserDelegate.lock();
        if (host != nullptr && (*host).*Method) ((*host).*Method)(arguments...);
    }

private:
    void _ShowAlert(XmlStreamParser& parser, const XmlError& error, const char* messageText,
                    const char* format);

    std::unique_ptr<muxml::CScoreIndex> mIndex;  // of the root only
    std::int32_t mAlertCount = 0;                // of the root only
};

}  // namespace brindle
