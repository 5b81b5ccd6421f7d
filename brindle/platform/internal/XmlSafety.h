// SPDX-License-Identifier: MIT
#pragma once

// Internal to platform/: what both XML readers do so that a document reaches nothing outside
// itself, takes no more time and memory than its size asks for, and is never read in part because
// memory was short.

#include "brindle/platform/XmlError.h"

#include <libxml/parser.h>

#include <cstddef>
#include <exception>
#include <memory>
#include <optional>
#include <string_view>

namespace brindle::xml {

/// What a text is told that is longer than kXmlMaxTextLength.
inline constexpr const char* kXmlTextTooLong = "text longer than 10,000,000 bytes";

/// Starts the XML library once, before the first thread uses it.
void StartLibrary();

/// Hears what the XML library reports to nobody, which else it would print, and remembers whether
/// memory was short. For one thread; the former listener comes back at the end.
class CErrorListener {
public:
    CErrorListener();
    ~CErrorListener();
    CErrorListener(const CErrorListener&) = delete;
    CErrorListener& operator=(const CErrorListener&) = delete;

    [[nodiscard]] bool WasShort() const { return mWasShort; }

private:
    static void Hear(void* self, xmlErrorPtr error);

    xmlStructuredErrorFunc mFormer;
    void* mFormerContext;
    bool mWasShort = false;
};

/// Listens while the XML library is used, which it starts if that has not been done.
class CMemoryWatch {
public:
    CMemoryWatch();

    /// Throws `std::bad_alloc` if memory was short since the beginning.
    void Check() const;

private:
    CErrorListener mListener;
};

/// One parse of bytes in memory. Entities of the document itself are expanded; every external one
/// is forgotten, no document type is loaded and the network is never used.
class CParse {
public:
    using TStartElement = void (*)(CParse&, const xmlChar* name, int attributeCount,
                                   const xmlChar** attributes);

    explicit CParse(std::string_view bytes);
    CParse(const CParse&) = delete;
    CParse& operator=(const CParse&) = delete;
    ~CParse();

    /// The parse whose context a callback is given.
    [[nodiscard]] static CParse& Of(void* context);

    [[nodiscard]] xmlParserCtxt& Context() { return *mContext; }
    [[nodiscard]] xmlSAXHandler& Handler() { return *mContext->sax; }
    /// Is called instead of building the tree.
    void SetStartElement(TStartElement startElement) { mStartElement = startElement; }

    /// Parses all bytes. Passes on what a step has thrown, and `std::bad_alloc`. The first fault
    /// otherwise.
    [[nodiscard]] std::optional<XmlError> Run();
    /// The document that was built, which is the caller's from then on.
    [[nodiscard]] xmlDoc* TakeDocument();

    /// Ends the parse with this fault, unless there is one.
    void Refuse(const char* description);
    /// Runs a step of a callback. No exception may pass the C library: it ends the parse and waits.
    template <class Step>
    void Guarded(Step step) {
        if (mThrown) return;
        try {
            step();
        } catch (...) {
            mThrown = std::current_exception();
            xmlStopParser(mContext);
        }
    }

    void* mHost = nullptr;  ///< for the callbacks of the host

private:
    struct Callbacks;

    [[nodiscard]] bool IsTagTooLong() const;
    void EndInTag();
    void Keep(XmlError error);

    std::string_view mRest;  // of the bytes
    xmlParserCtxt* mContext = nullptr;
    TStartElement mStartElement = nullptr;
    int mDeclaredAttributes = 0;
    int mDefaultedAttributes = 0;
    int mLineOfLongTag = 0;
    int mColumnInLongTag = 0;
    bool mWasMemoryShort = false;
    bool mIsBeyondLimit = false;  // of the XML library
    std::optional<XmlError> mError;
    std::exception_ptr mThrown;
};

}  // namespace brindle::xml
