// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/XmlError.h"

#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace brindle {

/// Longest text between two tags, in bytes; a longer one fails the parse.
inline constexpr std::size_t kXmlMaxTextLength = 10'000'000;

/// The attributes of one element, valid during the call that brings them.
class XmlAttributes {
public:
    XmlAttributes() = default;
    /// For the parser; the fields are borrowed, five an attribute.
    XmlAttributes(const unsigned char* const* fields, int count) : mFields(fields), mCount(count) {}

    /// Value of the attribute; nothing if it is not there. Prefixes of names are not looked at.
    [[nodiscard]] std::optional<std::string_view> Find(std::string_view name) const;
    /// Value of the attribute, or an empty text.
    [[nodiscard]] std::string_view Value(std::string_view name) const {
        return Find(name).value_or(std::string_view());
    }
    /// The number of attributes.
    [[nodiscard]] int size() const { return mCount; }
    /// Name and value of the n-th attribute, counted from 0.
    [[nodiscard]] std::pair<std::string_view, std::string_view> At(int n) const;

private:
    const unsigned char* const* mFields = nullptr;  // five fields an attribute
    int mCount = 0;
};

class XmlStreamParser;

/// Receives the events of a streaming parse. Virtual, since the receiver changes while parsing:
/// each event goes to the delegate that is set when it happens, and a delegate may be destroyed by
/// the event that it handles.
class XmlStreamDelegate {
public:
    virtual ~XmlStreamDelegate() = default;
    /// Before all else; an empty or too long text has only the error.
    virtual void didStartDocument(XmlStreamParser&) {}
    /// Only for a well-formed text.
    virtual void didEndDocument(XmlStreamParser&) {}
    /// A start tag; name and attributes are valid during the call.
    virtual void didStartElement(XmlStreamParser&, std::string_view name, const XmlAttributes&) = 0;
    /// An end tag, also of an empty element.
    virtual void didEndElement(XmlStreamParser&, std::string_view name) = 0;
    /// All text between two tags in one piece, white space included; never empty.
    virtual void foundCharacters(XmlStreamParser&, std::string_view text) = 0;
    /// The text is not well-formed; it is the last event.
    virtual void parseErrorOccurred(XmlStreamParser&, const XmlError&) {}
};

/// A streaming XML parse of bytes in memory, in any encoding that they declare.
///
/// Nothing outside the bytes is ever read: external entities and document types are left unread,
/// entities that are defined inside expand within narrow limits, and nesting is limited too. An
/// element with more than 1000 attributes is a fault.
/// Names of elements come without their prefix.
class XmlStreamParser {
public:
    XmlStreamParser();
    ~XmlStreamParser();
    XmlStreamParser(const XmlStreamParser&) = delete;
    XmlStreamParser& operator=(const XmlStreamParser&) = delete;

    /// The delegate is not owned. It may be set during a parse: the next event goes to it.
    void setDelegate(XmlStreamDelegate* delegate) { mDelegate = delegate; }
    /// The delegate that gets the next event; null for none.
    [[nodiscard]] XmlStreamDelegate* delegate() const { return mDelegate; }

    /// Whether text is delivered from here on; a delegate that reads few texts saves time by this.
    /// A parse begins with all text delivered.
    void setTextWanted(bool isWanted) { mIsTextWanted = isWanted; }

    /// True when the text is well-formed; else parserError tells the first fault. Events before the
    /// fault have been delivered. What the delegate throws ends the parse and is passed on.
    bool parse(std::string_view bytes);

    /// The fault that ended the last parse; nothing if it was well-formed.
    [[nodiscard]] const std::optional<XmlError>& parserError() const { return mError; }
    /// The line that the parse has reached, from 1; 0 when none is running.
    [[nodiscard]] int lineNumber() const;
    /// The column in that line, from 1; 0 when none is running.
    [[nodiscard]] int columnNumber() const;

private:
    struct Callbacks;

    void Deliver();

    XmlStreamDelegate* mDelegate = nullptr;
    void* mContext = nullptr;  // of the parse that runs
    bool mIsTextWanted = true;
    std::string mText;                // gathered since the last tag
    std::size_t mUnwantedLength = 0;  // of other text since then
    std::optional<XmlError> mError;
};

}  // namespace brindle
