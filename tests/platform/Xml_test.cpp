// SPDX-License-Identifier: MIT
#include "brindle/platform/XmlDocument.h"
#include "brindle/platform/XmlStreamParser.h"

#include <doctest/doctest.h>

#include <string>
#include <vector>

using namespace brindle;

namespace {

// Writes every event into one text: <a k=v> text </a>.
class CRecorder : public XmlStreamDelegate {
public:
    void didStartElement(XmlStreamParser&, std::string_view name,
                         const XmlAttributes& attributes) override {
        mEvents += "<" + std::string(name);
        for (int n = 0; n < attributes.size(); ++n) {
            mEvents += " " + std::string(attributes.At(n).first) + "=" +
                       std::string(attributes.At(n).second);
        }
        mEvents += ">";
    }
    void didEndElement(XmlStreamParser&, std::string_view name) override {
        mEvents += "</" + std::string(name) + ">";
    }
    void foundCharacters(XmlStreamParser&, std::string_view text) override {
        mEvents += "[" + std::string(text) + "]";
    }
    void didEndDocument(XmlStreamParser&) override { mEvents += "."; }
    void parseErrorOccurred(XmlStreamParser&, const XmlError&) override { mEvents += "!"; }

    std::string mEvents;
};

std::string EventsOf(std::string_view bytes) {
    CRecorder recorder;
    XmlStreamParser parser;
    parser.setDelegate(&recorder);
    parser.parse(bytes);
    return recorder.mEvents;
}

std::string Repeated(std::string_view piece, int count) {
    std::string text;
    for (int i = 0; i < count; ++i) text += piece;
    return text;
}

bool IsRefused(const std::string& bytes) {
    XmlStreamParser parser;
    const bool streamRefuses = !parser.parse(bytes) && parser.parserError().has_value();
    const bool treeRefuses = std::holds_alternative<XmlError>(XmlDocument::FromBytes(bytes));
    CHECK(streamRefuses == treeRefuses);
    return streamRefuses && treeRefuses;
}

}  // namespace

TEST_CASE("A streaming parse brings elements, attributes and whole texts in order") {
    CHECK(EventsOf("<a k='1' l='x &amp; y'>one &amp; <![CDATA[two]]><!-- no --> 3<b/></a>") ==
          "<a k=1 l=x & y>[one & two 3]<b></b></a>.");
    CHECK(EventsOf("<a><b></a>") == "<a><b>!");
    CHECK(EventsOf("") == "!");
    CHECK(EventsOf("\xFF\xFE<\0a\0/\0>\0" + std::string()) == "!");
    CHECK(EventsOf(std::string("\xFF\xFE<\0a\0/\0>\0", 10)) == "<a></a>.");
    CHECK(EventsOf("<?xml version='1.0' encoding='ISO-8859-1'?><a>\xE9</a>") == "<a>[é]</a>.");
}

TEST_CASE("A parse error tells its place") {
    XmlStreamParser parser;
    CHECK_FALSE(parser.parse("<a>\n  <b>\n</a>"));
    REQUIRE(parser.parserError().has_value());
    CHECK(parser.parserError()->mLine == 3);
    CHECK(parser.parserError()->mDescription == "Opening and ending tag mismatch: b line 2 and a");
}

TEST_CASE("Documents never reach outside themselves, and hostile ones are refused") {
    // What an external entity points to is not read: the reference stands for nothing, or fails.
    const std::string external =
        "<!DOCTYPE a [<!ENTITY x SYSTEM 'file:///etc/hostname'>]><a>&x;</a>";
    CHECK(EventsOf(external).find('[') == std::string::npos);
    const auto tree = XmlDocument::FromBytes(external);
    if (const auto* document = std::get_if<XmlDocument>(&tree)) {
        CHECK(document->rootElement().stringValue().empty());
    }
    CHECK(EventsOf("<!DOCTYPE a SYSTEM 'http://127.0.0.1:9/x.dtd'><a/>") == "<a></a>.");
    CHECK(EventsOf("<!DOCTYPE a [<!ENTITY x 'in'>]><a>&x;side</a>") == "<a>[inside]</a>.");

    std::string bomb = "<!DOCTYPE a [<!ENTITY x0 'xxxxxxxxxx'>";
    for (int i = 1; i < 12; ++i) {
        const std::string inner = "&x" + std::to_string(i - 1) + ";";
        bomb += "<!ENTITY x" + std::to_string(i) + " '" + Repeated(inner, 10) + "'>";
    }
    CHECK(IsRefused(bomb + "]><a>&x11;</a>"));
    CHECK(IsRefused(Repeated("<a>", 100'000) + Repeated("</a>", 100'000)));
    CHECK(EventsOf("<a>" + std::string(kXmlMaxTextLength + 1, 'x') + "</a>") == "<a>!");
    CHECK(IsRefused("<a>&undefined;</a>"));
}

TEST_CASE("Paths find nodes in document order") {
    const auto tree = XmlDocument::FromBytes(
        "<s><p id='P1'><m>1</m><m>2</m></p><p id='P2'><m>3<x>4</x></m></p></s>");
    const XmlNode root = std::get<XmlDocument>(tree).rootElement();
    CHECK(root.name() == "s");
    CHECK(root.nodesForXPath(".//m").size() == 3);
    CHECK(root.firstForXPath("(p[@id='P2'])[1]/m").stringValue() == "34");
    CHECK(root.firstForXPath(".//p//@id").stringValue() == "P1");
    CHECK(root.child("p").nextSibling().attribute("id") == "P2");
    CHECK_FALSE(root.firstForXPath(".//nothing"));
    CHECK_FALSE(root.firstForXPath("((("));
    CHECK(XmlNode().stringValue().empty());
}
