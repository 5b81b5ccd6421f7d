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

std::string_view TextOf(const unsigned char* text) {
    return text == nullptr ? std::string_view() : reinterpret_cast<const char*>(text);
}

xmlParserCtxtPtr ContextOf(void* context) {
    return static_cast<xmlParserCtxtPtr>(context);
}

// A streaming parse makes a document for the entities that are defined inside.
struct TContextEnd {
    void operator()(xmlParserCtxtPtr context) const {
        xmlFreeDoc(context->myDoc);
        context->myDoc = nullptr;
        xmlFreeParserCtxt(context);
    }
};

}  // namespace

std::pair<std::string_view, std::string_view> XmlAttributes::At(int n) const {
    const unsigned char* const* fields = mFields + n * kFieldsPerAttribute;
    const auto* begin = reinterpret_cast<const char*>(fields[3]);
    const auto* end = reinterpret_cast<const char*>(fields[4]);
    return {TextOf(fields[0]), {begin, static_cast<std::size_t>(end - begin)}};
}

std::optional<std::string_view> XmlAttributes::Find(std::string_view name) const {
    for (int n = 0; n < mCount; ++n) {
        const auto attribute = At(n);
        if (attribute.first == name) return attribute.second;
    }
    return std::nullopt;
}

struct XmlStreamParser::Callbacks {
    static XmlStreamParser& Self(void* context) {
        return *static_cast<XmlStreamParser*>(ContextOf(context)->_private);
    }

    // No exception may pass the C library: it waits until the parse has been stopped.
    template <class Step>
    static void Guarded(void* context, Step step) {
        XmlStreamParser& self = Self(context);
        if (self.mThrown) return;
        try {
            step(self);
        } catch (...) {
            self.mThrown = std::current_exception();
            xmlStopParser(ContextOf(context));
        }
    }

    static void StartElement(void* context, const xmlChar* name, const xmlChar*, const xmlChar*,
                             int, const xmlChar**, int attributeCount, int,
                             const xmlChar** attributes) {
        Guarded(context, [&](XmlStreamParser& self) {
            self.Deliver();
            if (self.mDelegate == nullptr) return;
            self.mDelegate->didStartElement(self, TextOf(name), {attributes, attributeCount});
        });
    }

    static void EndElement(void* context, const xmlChar* name, const xmlChar*, const xmlChar*) {
        Guarded(context, [&](XmlStreamParser& self) {
            self.Deliver();
            if (self.mDelegate != nullptr) self.mDelegate->didEndElement(self, TextOf(name));
        });
    }

    static void Characters(void* context, const xmlChar* text, int length) {
        Guarded(context, [&](XmlStreamParser& self) {
            const auto size = static_cast<std::size_t>(length);
            if (self.mIsTextWanted) {
                self.mText.append(reinterpret_cast<const char*>(text), size);
            } else {
                self.mUnwantedLength += size;
            }
            if (self.mText.size() + self.mUnwantedLength <= kXmlMaxTextLength) return;
            self.Fail(
                {XML_ERR_INTERNAL_ERROR, "text too long", self.lineNumber(), self.columnNumber()});
            self.mText.clear();
            xmlStopParser(ContextOf(context));
        });
    }

    // Only the first fault is kept, and only one that makes the text not well-formed.
    static void FaultFound(void* context, xmlErrorPtr error) {
        if (error->level == XML_ERR_FATAL) Self(context).Fail(xml::ErrorFrom(*error));
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

void XmlStreamParser::Fail(XmlError error) {
    if (!mError) mError = std::move(error);
}

int XmlStreamParser::lineNumber() const {
    return mContext == nullptr ? 0 : xmlSAX2GetLineNumber(mContext);
}

int XmlStreamParser::columnNumber() const {
    return mContext == nullptr ? 0 : xmlSAX2GetColumnNumber(mContext);
}

bool XmlStreamParser::parse(std::string_view bytes) {
    mError.reset();
    mThrown = nullptr;
    mIsTextWanted = true;
    mUnwantedLength = 0;
    mText.clear();
    if (bytes.empty() || bytes.size() > std::numeric_limits<int>::max()) {
        mError = {XML_ERR_DOCUMENT_EMPTY, bytes.empty() ? "Document is empty" : "Document too long",
                  1, 1};
        if (mDelegate != nullptr) mDelegate->parseErrorOccurred(*this, *mError);
        return false;
    }
    const std::unique_ptr<xmlParserCtxt, TContextEnd> context(
        xmlCreateMemoryParserCtxt(bytes.data(), static_cast<int>(bytes.size())));
    if (!context) throw std::bad_alloc();
    xmlCtxtUseOptions(context.get(), xml::kOptions);
    xmlSAXHandler& handler = *context->sax;
    xml::RefuseOutsideWorld(handler);
    handler.startElementNs = Callbacks::StartElement;
    handler.endElementNs = Callbacks::EndElement;
    handler.characters = Callbacks::Characters;
    handler.ignorableWhitespace = Callbacks::Characters;
    handler.cdataBlock = Callbacks::Characters;
    handler.comment = nullptr;
    handler.processingInstruction = nullptr;
    handler.serror = Callbacks::FaultFound;
    context->_private = this;
    mContext = context.get();
    const auto forgetContext = [](void** place) { *place = nullptr; };
    const std::unique_ptr<void*, decltype(forgetContext)> atEnd(&mContext, forgetContext);

    if (mDelegate != nullptr) mDelegate->didStartDocument(*this);
    xmlParseDocument(context.get());
    if (mThrown) std::rethrow_exception(std::exchange(mThrown, nullptr));
    if (context->wellFormed == 0) Fail({XML_ERR_INTERNAL_ERROR, "not well-formed", 0, 0});
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
