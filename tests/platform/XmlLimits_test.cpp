// SPDX-License-Identifier: MIT
// What files may ask of the XML readers, and what the readers do when memory is short.
#include "brindle/platform/XmlDocument.h"
#include "brindle/platform/XmlStreamParser.h"

#include <doctest/doctest.h>
// GCC tells of the address sanitizer by a macro, clang by a feature.
#if defined(__has_feature)
#if __has_feature(address_sanitizer)
#define BRINDLE_COUNTS_LEAKS
#endif
#elif defined(__SANITIZE_ADDRESS__)
#define BRINDLE_COUNTS_LEAKS
#endif
#ifdef BRINDLE_COUNTS_LEAKS
#include <sanitizer/lsan_interface.h>
#endif
#include <libxml/parser.h>
#include <libxml/xmlmemory.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <new>
#include <optional>
#include <string>
#include <thread>
#include <vector>

using namespace brindle;

namespace {

std::string Repeated(int count, const std::function<std::string(int)>& piece) {
    std::string text;
    for (int n = 0; n < count; ++n) text += piece(n);
    return text;
}

std::string Attributes(int count) {
    return Repeated(count, [](int n) { return " a" + std::to_string(n) + "='1'"; });
}

std::optional<XmlError> StreamError(const std::string& bytes) {
    XmlStreamParser parser;
    (void)parser.parse(bytes);
    return parser.parserError();
}

std::optional<XmlError> TreeError(const std::string& bytes) {
    auto tree = XmlDocument::FromBytes(bytes);
    const auto* const error = std::get_if<XmlError>(&tree);
    return error == nullptr ? std::nullopt : std::optional<XmlError>(*error);
}

std::string Utf16(const std::string& text) {
    std::string bytes = "\xFF\xFE";
    for (const char c : text) bytes.append({c, '\0'});
    return bytes;
}

/// Seconds that both readers take.
double SecondsFor(const std::string& bytes) {
    const auto begin = std::chrono::steady_clock::now();
    (void)StreamError(bytes);
    (void)TreeError(bytes);
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - begin).count();
}

#ifdef BRINDLE_COUNTS_LEAKS
/// The XML library loses some of its own blocks when its memory is short.
using CLeaksAllowed = __lsan::ScopedDisabler;
#else
struct CLeaksAllowed {};
#endif

/// Fails the request for memory of the XML library of this number, counted from 1, or this one and
/// all that follow.
class CShortMemory {
public:
    enum TExtent { One, AllFollowing };

    CShortMemory(long failing, TExtent extent) {
        sLeft = failing;
        sExtent = extent;
        sHasFailed = false;
        xmlMemSetup(std::free, Allocate, Reallocate, Duplicate);
    }
    CShortMemory(const CShortMemory&) = delete;
    CShortMemory& operator=(const CShortMemory&) = delete;
    ~CShortMemory() { xmlMemSetup(std::free, std::malloc, std::realloc, strdup); }

    [[nodiscard]] bool HasFailed() const { return sHasFailed; }

private:
    static bool IsTurn() {
        if (--sLeft > 0 || (sLeft < 0 && sExtent == One)) return false;
        return sHasFailed = true;
    }
    static void* Allocate(std::size_t size) { return IsTurn() ? nullptr : std::malloc(size); }
    static void* Reallocate(void* old, std::size_t size) {
        return IsTurn() ? nullptr : std::realloc(old, size);
    }
    static char* Duplicate(const char* text) { return IsTurn() ? nullptr : strdup(text); }

    [[maybe_unused]] CLeaksAllowed mLeaksAllowed;
    static inline long sLeft = 0;
    static inline TExtent sExtent = One;
    static inline bool sHasFailed = false;
};

/// Writes all that the stream tells.
class CTeller : public XmlStreamDelegate {
public:
    void didStartElement(XmlStreamParser&, std::string_view name,
                         const XmlAttributes& attributes) override {
        mTold.append("<").append(name);
        for (int n = 0; n < attributes.size(); ++n) {
            mTold.append(" ").append(attributes.At(n).first).append("=");
            mTold.append(attributes.At(n).second);
        }
        mTold += ">";
    }
    void didEndElement(XmlStreamParser&, std::string_view name) override {
        mTold.append("</").append(name).append(">");
    }
    void foundCharacters(XmlStreamParser&, std::string_view text) override { mTold += text; }
    void parseErrorOccurred(XmlStreamParser&, const XmlError& error) override {
        mTold += "!" + error.mDescription;
    }

    std::string mTold;
};

std::string ToldByStream(const std::string& bytes) {
    CTeller teller;
    XmlStreamParser parser;
    parser.setDelegate(&teller);
    (void)parser.parse(bytes);
    return teller.mTold;
}

std::string ToldByTree(const std::string& bytes) {
    const auto tree = XmlDocument::FromBytes(bytes);
    if (const auto* const error = std::get_if<XmlError>(&tree)) return "!" + error->mDescription;
    const XmlNode root = std::get<XmlDocument>(tree).rootElement();
    std::string told = root.stringValue() + root.nextBelow(root).stringValue();
    told += root.child("c").attribute("x").value_or("none");
    std::size_t room = 1000;
    XmlNode(root.child("c")).addCopyOf(root.child("b"), room);
    return told + std::to_string(room) + root.child("c").stringValue();
}

std::string ToldByPaths(const XmlNode& root) {
    std::string told;
    for (const char* const path : {".//b", "c[2]", "//@x", "(c/d)[1]", "c[@x='2']/d"}) {
        for (const XmlNode& node : root.nodesForXPath(path)) told += "," + node.stringValue();
    }
    return told;
}

const std::string kDocument =
    "<?xml version='1.0' encoding='ISO-8859-1'?><!DOCTYPE a [<!ENTITY e 'of an entity'>"
    "<!ATTLIST c y CDATA 'default'>]>"
    "<a xmlns:n='u'><b>a text that is longer than a node keeps &amp; more &e;</b>"
    "<c x='the value of an attribute &e;'><d>\xE9</d></c><n:c x='2'><d>" +
    std::string(300, 'z') + "</d></n:c></a>";

}  // namespace

TEST_CASE("An element with thousands of attributes is refused with its place, at once") {
    for (const int count : {100, 999, 1'000}) {
        const std::string fine = "<a>\n<b" + Attributes(count) + "/></a>";
        CHECK_FALSE(StreamError(fine));
        CHECK_FALSE(TreeError(fine));
    }
    for (const int count : {1'001, 40'000, 200'000}) {
        for (const auto encoded : {+[](const std::string& text) { return text; },
                                   +[](const std::string& text) { return Utf16(text); }}) {
            const std::string bytes = encoded("<a>\n<b" + Attributes(count) + "/></a>");
            for (const auto& error : {StreamError(bytes), TreeError(bytes)}) {
                REQUIRE(error);
                CHECK(error->mDescription == "element with more than 1000 attributes");
                CHECK(error->mLine == 2);
                CHECK(error->mColumn > 1);
            }
            CHECK(SecondsFor(bytes) < 1.0);
        }
    }
}

TEST_CASE("What is too long or too deep is told as that, with its place") {
    const std::string longText(10'000'001, 'x');
    const std::string longerText(11'000'000, 'x');
    const std::string longName(50'001, 'n');
    const auto nested = [](const std::string& open, int depth) {
        return Repeated(depth, [&](int) { return open; });
    };
    struct CRow {
        std::string mBytes;
        const char* mDescription;
    };
    const CRow rows[] = {
        {"<a>\n" + nested("<b>", 300), "elements inside each other more than 256 deep"},
        {"<!DOCTYPE a [\n<!ELEMENT a " + nested("(", 200) + "b",
         "document type with brackets inside each other more than 128 deep"},
        {"<a>\n<b>" + longText + "</b></a>", "text longer than 10,000,000 bytes"},
        {"<a>\n<![CDATA[" + longText + "]]></a>", "text longer than 10,000,000 bytes"},
        {"<a>\n<b c='" + longText + "'/></a>", "attribute or entity longer than 10,000,000 bytes"},
        {"<a>\n<b c='" + longerText + "'/></a>",
         "attribute or entity longer than 10,000,000 bytes"},
        {"<!DOCTYPE a [\n<!ENTITY e '" + longText + "'>]><a/>",
         "attribute or entity longer than 10,000,000 bytes"},
        {"<a>\n<?p " + longText + "?></a>", "processing instruction longer than 10,000,000 bytes"},
        {"<a>\n<" + longName + "/></a>", "name longer than 50,000 bytes"},
        {"<!DOCTYPE a [\n<!ENTITY e '<b/>'>]><a>&e;</a>", "entity with elements inside"},
    };
    for (const CRow& row : rows) {
        INFO(row.mBytes.substr(0, 30));
        for (const auto& error : {StreamError(row.mBytes), TreeError(row.mBytes)}) {
            REQUIRE(error);
            CHECK(error->mDescription == row.mDescription);
            CHECK(error->mLine == 2);
        }
    }
    CHECK(TreeError("<a>\n<!--" + longText + "--></a>")->mDescription ==
          "comment longer than 10,000,000 bytes");
}

TEST_CASE("A fault inside an entity is told where the document has it") {
    const std::string bytes =
        "<!DOCTYPE a [<!ENTITY e '&f;'><!ENTITY f '&e;'>]>\n<a>\n<b/>some &e;</a>";
    for (const auto& error : {StreamError(bytes), TreeError(bytes)}) {
        REQUIRE(error);
        CHECK(error->mLine == 3);
    }
}

TEST_CASE("Namespaces and default attributes take no more time than the file is long") {
    const auto names = [](int n) { return " xmlns:a" + std::to_string(n) + "='1'"; };
    CHECK(StreamError("<a" + Repeated(1'001, names) + "/>"));
    const auto declared = [](int n) { return "<!ATTLIST a a" + std::to_string(n) + " CDATA '1'>"; };
    const std::vector<std::string> hostile{
        "<a" + Repeated(300'000, names) + "/>",
        Repeated(250, [&](int) { return "<a" + Repeated(999, names) + ">"; }),
        "<!DOCTYPE a [" + Repeated(100'000, declared) + "]><a/>",
        "<!DOCTYPE a [" + Repeated(900, declared) + "]><a>" +
            Repeated(50'000, [](int) { return "<a/>"; }) + "</a>",
    };
    for (const std::string& bytes : hostile) {
        CAPTURE(bytes.substr(0, 60));
        CHECK(StreamError(bytes));
        CHECK(TreeError(bytes));
        CHECK(SecondsFor(bytes) < 3.0);
    }
    CHECK(ToldByStream("<!DOCTYPE a [<!ATTLIST a b CDATA 'x'>]><a c='y'/>") == "<a c=y b=x></a>");
}

TEST_CASE("Memory that is short while XML is read is never taken for an end or a nothing") {
    using TTell = std::string (*)(const std::string&);
    for (const TTell tell : {&ToldByStream, &ToldByTree}) {
        const std::string whole = tell(kDocument);
        REQUIRE(whole.find('!') == whole.npos);
        int failures = 0;
        for (long failing = 1; failing < 5'000; ++failing) {
            std::string told;
            bool wasShort = false;
            bool hasFailed = false;
            {
                const CShortMemory memory(failing, CShortMemory::One);
                try {
                    told = tell(kDocument);
                } catch (const std::bad_alloc&) {
                    wasShort = true;
                }
                hasFailed = memory.HasFailed();
            }
            CAPTURE(failing);
            // An entity that could not be kept is unknown afterwards, which is an error, too.
            const bool isRefused = wasShort || told.find("!Entity 'e' not defined") != told.npos;
            if (!isRefused) CHECK(told == whole);
            failures += isRefused;
            if (!hasFailed) break;
        }
        CHECK(failures > 50);
    }
    CHECK(ToldByTree(kDocument) == ToldByTree(kDocument));
}

// Each time in a process of its own: the XML library itself may die of short memory here.
TEST_CASE("A path that could not be evaluated for want of memory is no path that finds nothing") {
    const auto tree = XmlDocument::FromBytes(kDocument);
    const XmlNode root = std::get<XmlDocument>(tree).rootElement();
    const std::string whole = ToldByPaths(root);
    CHECK(whole.find(",the value of an attribute of an entity,2,") != whole.npos);
    enum { Same = 0, Different = 1, WasShort = 2, NotFailed = 3 };
    std::vector<int> outcomes(5, 0);
    int outcome = Same;
    for (long failing = 1; failing < 5'000 && outcome != NotFailed; ++failing) {
        const pid_t child = fork();
        if (child == 0) {
            std::signal(SIGSEGV, SIG_DFL);
            const CShortMemory memory(failing, CShortMemory::AllFollowing);
            try {
                const bool isSame = ToldByPaths(root) == whole;
                _exit(!isSame ? Different : memory.HasFailed() ? Same : NotFailed);
            } catch (const std::bad_alloc&) {
                _exit(WasShort);
            }
        }
        int status = 0;
        waitpid(child, &status, 0);
        outcome = WIFEXITED(status) ? WEXITSTATUS(status) : 4;
        ++outcomes[static_cast<std::size_t>(outcome)];
    }
    CHECK(outcomes[Different] == 0);
    CHECK(outcomes[WasShort] > 20);
    CHECK(outcomes[NotFailed] == 1);
}

TEST_CASE("Threads read at the same time from the first document on") {
    std::vector<std::thread> readers;
    std::vector<std::string> told(4);
    for (std::string& one : told) {
        readers.emplace_back([&one] { one = ToldByStream(kDocument) + ToldByTree(kDocument); });
    }
    for (std::thread& reader : readers) reader.join();
    for (const std::string& one : told) CHECK(one == told[0]);
}
