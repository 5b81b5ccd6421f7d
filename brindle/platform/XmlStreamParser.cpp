// SPDX-License-Identifier: MIT
#include "brindle/platform/XmlStreamParser.h"

#include "brindle/platform/internal/XmlSafety.h"

#include <libxml/SAX2.h>
#include <libxml/parserInternals.h>

#include <limits>
#include <utility>

namespace brindle {

namespace {

constexpr int kFieldsPerAttribute = 5;  // local name, prefix, namespace, begin and end of the value

std::string_view StreamedText(const unsigned char* text) {
    return text == nullptr ? std::string_view() : reinterpret_cast<const char*>(text);
}

}  // namespace

std::pair<std::string_view, std::string_view> XmlAttributes::At(int n) const {
    const unsigned char* const* fields = mFields + n * kFieldsPerAttribute;
    const auto* begin = reinterpret_cast<const char*>(fields[3]);
    const auto* end = reinterpret_cast<const char*>(fields[4]);
    return {StreamedText(fields[0]), {begin, static_cast<std::size_t>(end - begin)}};
}

std::optional<std::string_view> XmlAttributes::Find(std::string_view name) const {
    for (int n = 0; n < mCount; ++n) {
        const auto attribute = At(n);
        if (attribute.first == name) return attribute.second;
    }
    return std::nullopt;
}

struct XmlStreamParser::Callbacks {
    template <class Step>
    static void Guarded(xml::CParse& parse, Step step) {
        parse.Guarded([&] { step(*static_cast<XmlStreamParser*>(parse.mHost)); });
    }

    static void StartElement(xml::CParse& parse, const xmlChar* name, int attributeCount,
                             const xmlChar** attributes) {
        auto& self = *static_cast<XmlStreamParser*>(parse.mHost);
        self.Deliver();
        if (self.mDelegate == nullptr) return;
        self.mDelegate->didStartElement(self, StreamedText(name), {attributes, attributeCount});
    }

    static void EndElement(void* context, const xmlChar* name, const xmlChar*, const xmlChar*) {
        Guarded(xml::CParse::Of(context), [&](XmlStreamParser& self) {
            self.Deliver();
            if (self.mDelegate != nullptr) self.mDelegate->didEndElement(self, StreamedText(name));
        });
    }

    static void Characters(void* context, const xmlChar* text, int length) {
        xml::CParse& parse = xml::CParse::Of(context);
        Guarded(parse, [&](XmlStreamParser& self) {
            const auto size = static_cast<std::size_t>(length);
            if (self.mIsTextWanted) {
                self.mText.append(reinterpret_cast<const char*>(text), size);
            } else {
                self.mUnwantedLength += size;
            }
            if (self.mText.size() + self.mUnwantedLength <= kXmlMaxTextLength) return;
            self.mText.clear();
            parse.Refuse(xml::kXmlTextTooLong);
        });
    }
};

XmlStreamParser::XmlStreamParser() = default;
XmlStreamParser::~XmlStreamParser() = default;

void XmlStreamParser::Deliver() {
    mUnwantedLength = 0;
    if (mText.empty()) return;
    if (mDelegate != nullptr) mDelegate->foundCharacters(*this, mText);
    mText.clear();
}

int XmlStreamParser::lineNumber() const {
    return mContext == nullptr ? 0 : xmlSAX2GetLineNumber(mContext);
}

int XmlStreamParser::columnNumber() const {
    return mContext == nullptr ? 0 : xmlSAX2GetColumnNumber(mContext);
}

bool XmlStreamParser::parse(std::string_view bytes) {
    mError.reset();
    mIsTextWanted = true;
    mUnwantedLength = 0;
    mText.clear();
    if (bytes.empty() || bytes.size() > std::numeric_limits<int>::max()) {
        mError = {XML_ERR_DOCUMENT_EMPTY, bytes.empty() ? "Document is empty" : "Document too long",
                  1, 1};
        if (mDelegate != nullptr) mDelegate->parseErrorOccurred(*this, *mError);
        return false;
    }
    xml::CParse parse(bytes);
    parse.mHost = this;
    parse.SetStartElement(Callbacks::StartElement);
    xmlSAXHandler& handler = parse.Handler();
    handler.endElementNs = Callbacks::EndElement;
    handler.characters = Callbacks::Characters;
    handler.ignorableWhitespace = Callbacks::Characters;
    handler.cdataBlock = Callbacks::Characters;
    handler.comment = nullptr;
    handler.processingInstruction = nullptr;
    mContext = &parse.Context();
    const auto forgetContext = [](void** place) { *place = nullptr; };
    const std::unique_ptr<void*, decltype(forgetContext)> atEnd(&mContext, forgetContext);

    if (mDelegate != nullptr) mDelegate->didStartDocument(*this);
    mError = parse.Run();
    if (mDelegate != nullptr) {
        if (mError) {
            mDelegate->parseErrorOccurred(*this, *mError);
        } else {
            mDelegate->didEndDocument(*this);
        }
    }
    return !mError;
}

}  // namespace brindle
