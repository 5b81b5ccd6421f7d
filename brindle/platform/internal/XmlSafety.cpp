// SPDX-License-Identifier: MIT
// The XML library takes n squared steps for the n attributes of an element, some of them before it
// tells of the element. So it is given the bytes piece by piece and gets no more of them when it
// has a tag with too many at hand.
#include "brindle/platform/internal/XmlSafety.h"

#include <libxml/SAX2.h>
#include <libxml/parserInternals.h>
#include <libxml/xmlerror.h>

#include <algorithm>
#include <array>
#include <cstring>
#include <mutex>
#include <new>
#include <string>
#include <utility>

namespace brindle::xml {

namespace {

// No score has more than some tens in an element.
constexpr int kMaxAttributes = 1'000;
// Of a document type that the document brings: declared ones, and those that elements get from it.
constexpr int kMaxDeclaredAttributes = 1'000;
constexpr int kMaxDefaultedAttributes = 100'000;

constexpr const char* kTooManyAttributes = "element with more than 1000 attributes";

constexpr int kOptions = XML_PARSE_NOENT | XML_PARSE_NONET | XML_PARSE_BIG_LINES;

constexpr const char* kAttributeTooLong = "attribute or entity longer than 10,000,000 bytes";

/// What the XML library says where a document is beyond one of its limits, which it tells as short
/// memory or as an option that a program could set; and what that is for people.
struct CLimitWords {
    const char* mMessage;
    const char* mWords;
};

constexpr auto kLimitWords = std::to_array<CLimitWords>({
    {"Excessive depth", "elements inside each other more than 256 deep"},
    {"ContentDecl : depth", "document type with brackets inside each other more than 128 deep"},
    {"huge text node", kXmlTextTooLong},
    {"CData section too big", kXmlTextTooLong},
    {"AttValue length too long", kAttributeTooLong},
    {"entity value too long", kAttributeTooLong},
    {"Huge input lookup", kAttributeTooLong},
    {"buffer error: text too long", kAttributeTooLong},
    {"Comment too big", "comment longer than 10,000,000 bytes"},
    {" too big found", "processing instruction longer than 10,000,000 bytes"},
    {"Name too long", "name longer than 50,000 bytes"},
});
static_assert(XML_MAX_TEXT_LENGTH == 10'000'000 && XML_MAX_NAME_LENGTH == 50'000);

/// Null for an error that is no limit.
const char* WordsOfLimit(const char* message) {
    if (message == nullptr) return nullptr;
    const auto found =
        std::find_if(kLimitWords.begin(), kLimitWords.end(), [message](const CLimitWords& row) {
            return std::strstr(message, row.mMessage) != nullptr;
        });
    return found == kLimitWords.end() ? nullptr : found->mWords;
}

bool IsShortMemory(const xmlError& error) {
    return error.code == XML_ERR_NO_MEMORY && WordsOfLimit(error.message) == nullptr;
}

XmlError ErrorFrom(const xmlError& error) {
    if (const char* const words = WordsOfLimit(error.message)) {
        return {XML_ERR_INTERNAL_ERROR, words, error.line, error.int2};
    }
    std::string text = error.message == nullptr ? "unknown XML error" : error.message;
    std::replace(text.begin(), text.end(), '\n', ' ');
    while (!text.empty() && text.back() == ' ') text.pop_back();
    return {error.code, text, error.line, error.int2};
}

}  // namespace

// The library prints what it lacks at its start unless somebody listens already. Its second start
// does nothing, so that one short of memory is told once.
void StartLibrary() {
    static std::once_flag once;
    std::call_once(once, [] {
        const CErrorListener listener;
        xmlInitParser();
        if (listener.WasShort()) throw std::bad_alloc();
    });
}

CErrorListener::CErrorListener()
    : mFormer(xmlStructuredError), mFormerContext(xmlStructuredErrorContext) {
    xmlSetStructuredErrorFunc(this, Hear);
}

CErrorListener::~CErrorListener() {
    xmlSetStructuredErrorFunc(mFormerContext, mFormer);
}

void CErrorListener::Hear(void* self, xmlErrorPtr error) {
    if (IsShortMemory(*error)) static_cast<CErrorListener*>(self)->mWasShort = true;
}

CMemoryWatch::CMemoryWatch() : mListener((StartLibrary(), CErrorListener())) {}

void CMemoryWatch::Check() const {
    if (mListener.WasShort()) throw std::bad_alloc();
}

struct CParse::Callbacks {
    static int Read(void* self, char* buffer, int length) {
        CParse& parse = *static_cast<CParse*>(self);
        if (parse.mContext != nullptr && parse.IsTagTooLong()) parse.EndInTag();
        const auto count = std::min(static_cast<std::size_t>(length), parse.mRest.size());
        std::copy_n(parse.mRest.begin(), count, buffer);
        parse.mRest.remove_prefix(count);
        return static_cast<int>(count);
    }

    static void StartElement(void* context, const xmlChar* name, const xmlChar* prefix,
                             const xmlChar* uri, int namespaceCount, const xmlChar** namespaces,
                             int attributeCount, int defaultedCount, const xmlChar** attributes) {
        CParse& parse = Of(context);
        parse.mDefaultedAttributes += defaultedCount;
        if (attributeCount > kMaxAttributes || namespaceCount > kMaxAttributes) {
            parse.Guarded([&] { parse.Refuse(kTooManyAttributes); });
        } else if (parse.mDefaultedAttributes > kMaxDefaultedAttributes) {
            parse.Guarded([&] { parse.Refuse("too many attributes from the document type"); });
        } else if (parse.mStartElement != nullptr) {
            parse.Guarded([&] { parse.mStartElement(parse, name, attributeCount, attributes); });
        } else {
            xmlSAX2StartElementNs(context, name, prefix, uri, namespaceCount, namespaces,
                                  attributeCount, defaultedCount, attributes);
        }
    }

    static void DeclareAttribute(void* context, const xmlChar* element, const xmlChar* name,
                                 int type, int defaultKind, const xmlChar* defaultValue,
                                 xmlEnumerationPtr tree) {
        xmlSAX2AttributeDecl(context, element, name, type, defaultKind, defaultValue, tree);
        CParse& parse = Of(context);
        if (++parse.mDeclaredAttributes <= kMaxDeclaredAttributes) return;
        parse.Guarded([&] { parse.Refuse("document type with more than 1000 attributes"); });
    }

    // An external entity is never declared, so that a reference to it finds nothing to load. One
    // with elements inside, which no score has, is copied into the tree wherever it is named: ten
    // kilobytes become gigabytes.
    static void DeclareInternalEntity(void* context, const xmlChar* name, int type,
                                      const xmlChar* publicId, const xmlChar* systemId,
                                      xmlChar* content) {
        const bool isInternal =
            type == XML_INTERNAL_GENERAL_ENTITY || type == XML_INTERNAL_PARAMETER_ENTITY;
        if (!isInternal) return;
        xmlSAX2EntityDecl(context, name, type, publicId, systemId, content);
        if (type == XML_INTERNAL_PARAMETER_ENTITY || xmlStrchr(content, '<') == nullptr) return;
        CParse& parse = Of(context);
        parse.Guarded([&] { parse.Refuse("entity with elements inside"); });
    }

    static void IgnoreExternalSubset(void*, const xmlChar*, const xmlChar*, const xmlChar*) {}

    static xmlParserInputPtr ResolveNothing(void*, const xmlChar*, const xmlChar*) {
        return nullptr;
    }

    // Only the first fault is kept, and only one that makes the text not well-formed.
    static void FaultFound(void* context, xmlErrorPtr error) {
        CParse& parse = Of(context);
        const bool isLimit = WordsOfLimit(error->message) != nullptr;
        if (isLimit) parse.mIsBeyondLimit = true;
        // Behind a limit the library tells of short memory that it never asked for.
        if (IsShortMemory(*error) && !parse.mIsBeyondLimit) parse.mWasMemoryShort = true;
        if (error->level != XML_ERR_FATAL && !isLimit) return;
        parse.Guarded([&] {
            XmlError fault = ErrorFrom(*error);
            // A fault inside an entity, which may have a context of its own, stands where the
            // document has it.
            if (context != &parse.Context() || parse.Context().inputNr > 1) {
                const xmlParserInput& document = *parse.Context().inputTab[0];
                fault.mLine = document.line;
                fault.mColumn = document.col;
            }
            parse.Keep(std::move(fault));
        });
    }
};

CParse::CParse(std::string_view bytes) : mRest(bytes) {
    const CMemoryWatch watch;
    mContext = xmlCreateIOParserCtxt(nullptr, nullptr, Callbacks::Read, nullptr, this,
                                     XML_CHAR_ENCODING_NONE);
    if (mContext == nullptr) throw std::bad_alloc();
    mContext->_private = this;
    xmlCtxtUseOptions(mContext, kOptions);
    xmlSAXHandler& handler = Handler();
    handler.startElementNs = Callbacks::StartElement;
    handler.attributeDecl = Callbacks::DeclareAttribute;
    handler.entityDecl = Callbacks::DeclareInternalEntity;
    handler.externalSubset = Callbacks::IgnoreExternalSubset;
    handler.resolveEntity = Callbacks::ResolveNothing;
    handler.serror = Callbacks::FaultFound;
}

CParse::~CParse() {
    // A parse makes a document in any case, for the entities that are defined inside.
    xmlFreeDoc(TakeDocument());
    xmlFreeParserCtxt(mContext);
}

CParse& CParse::Of(void* context) {
    return *static_cast<CParse*>(static_cast<xmlParserCtxtPtr>(context)->_private);
}

std::optional<XmlError> CParse::Run() {
    const CMemoryWatch watch;
    xmlParseDocument(mContext);
    if (mThrown) std::rethrow_exception(std::exchange(mThrown, nullptr));
    if (mWasMemoryShort) throw std::bad_alloc();
    watch.Check();
    if (mLineOfLongTag > 0) {
        mError = {XML_ERR_INTERNAL_ERROR, kTooManyAttributes, mLineOfLongTag, mColumnInLongTag};
    } else if (!mError && mContext->wellFormed == 0) {
        mError = {XML_ERR_INTERNAL_ERROR, "not well-formed", 0, 0};
    }
    return mError;
}

xmlDoc* CParse::TakeDocument() {
    return std::exchange(mContext->myDoc, nullptr);
}

void CParse::Refuse(const char* description) {
    Keep({XML_ERR_INTERNAL_ERROR, description, xmlSAX2GetLineNumber(mContext),
          xmlSAX2GetColumnNumber(mContext)});
    xmlStopParser(mContext);
}

// The parser is reading and can't be stopped: it finds the end of the bytes.
void CParse::EndInTag() {
    if (mLineOfLongTag == 0) {
        mLineOfLongTag = xmlSAX2GetLineNumber(mContext);
        mColumnInLongTag = xmlSAX2GetColumnNumber(mContext);
    }
    mRest = {};
}

// The array of the attributes grows to twice of what is needed, five fields each; there are two
// fields for each namespace that is declared.
bool CParse::IsTagTooLong() const {
    return mContext->maxatts > 2 * 5 * (kMaxAttributes + 2) || mContext->nsNr > 2 * kMaxAttributes;
}

void CParse::Keep(XmlError error) {
    if (!mError) mError = std::move(error);
}

}  // namespace brindle::xml
