// SPDX-License-Identifier: MIT
// In place of XmlDocument.cpp and XmlStreamParser.cpp in a library that reads no scores
// (BRINDLE_SCORES=OFF): nothing is well-formed, so no document, node or attribute ever is.
#include "brindle/platform/XmlDocument.h"
#include "brindle/platform/XmlStreamParser.h"

namespace brindle {

namespace {

XmlError NotReadHere() {
    return {0, "this build of the library reads no scores", 0, 0};
}

}  // namespace

std::pair<std::string_view, std::string_view> XmlAttributes::At(int) const {
    return {};
}

std::optional<std::string_view> XmlAttributes::Find(std::string_view) const {
    return std::nullopt;
}

XmlStreamParser::XmlStreamParser() = default;
XmlStreamParser::~XmlStreamParser() = default;

int XmlStreamParser::lineNumber() const {
    return 0;
}

int XmlStreamParser::columnNumber() const {
    return 0;
}

bool XmlStreamParser::parse(std::string_view) {
    mError = NotReadHere();
    if (mDelegate != nullptr) mDelegate->parseErrorOccurred(*this, *mError);
    return false;
}

std::string_view XmlNode::name() const {
    return {};
}

std::string XmlNode::stringValue() const {
    return {};
}

std::optional<std::string> XmlNode::attribute(std::string_view) const {
    return std::nullopt;
}

std::vector<XmlNode> XmlNode::children() const {
    return {};
}

XmlNode XmlNode::child(std::string_view) const {
    return {};
}

XmlNode XmlNode::firstChild() const {
    return {};
}

XmlNode XmlNode::nextSibling() const {
    return {};
}

XmlNode XmlNode::parent() const {
    return {};
}

XmlNode XmlNode::nextBelow(const XmlNode&) const {
    return {};
}

std::vector<XmlNode> XmlNode::descendants(std::string_view) const {
    return {};
}

XmlNode XmlNode::firstDescendant(std::string_view) const {
    return {};
}

XmlNode XmlNode::addCopyOf(const XmlNode&, std::size_t&) {
    return {};
}

int XmlNode::line() const {
    return 0;
}

std::vector<XmlNode> XmlNode::nodesForXPath(const XmlPath&) const {
    return {};
}

XmlNode XmlNode::firstForXPath(const XmlPath&) const {
    return {};
}

XmlPath::XmlPath(const char*) {}

std::variant<XmlDocument, XmlError> XmlDocument::FromBytes(std::string_view) {
    return NotReadHere();
}

XmlNode XmlDocument::rootElement() const {
    return {};
}

}  // namespace brindle
