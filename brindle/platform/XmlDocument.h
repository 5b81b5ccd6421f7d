// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/XmlError.h"

#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

struct _xmlNode;
struct _xmlDoc;
struct _xmlXPathCompExpr;

namespace brindle {

class XmlPath;

/// A small handle to an element or attribute of a document; valid while the document lives. A
/// handle may be empty, and every question to an empty one has the empty answer.
class XmlNode {
public:
    XmlNode() = default;
    /// For the readers below; null is an empty handle.
    explicit XmlNode(_xmlNode* node) : mNode(node) {}

    /// Whether it is a handle to something.
    [[nodiscard]] explicit operator bool() const { return mNode != nullptr; }
    /// Name without prefix.
    [[nodiscard]] std::string_view name() const;
    /// All text below, joined; the value of an attribute.
    [[nodiscard]] std::string stringValue() const;
    /// Value of an attribute of this element; nothing if it is not there.
    [[nodiscard]] std::optional<std::string> attribute(std::string_view name) const;
    /// The elements directly below, in document order.
    [[nodiscard]] std::vector<XmlNode> children() const;
    /// The first element directly below with this name, else an empty handle.
    [[nodiscard]] XmlNode child(std::string_view name) const;
    /// The first element directly below, else an empty handle.
    [[nodiscard]] XmlNode firstChild() const;
    /// The next element with the same parent, else an empty handle.
    [[nodiscard]] XmlNode nextSibling() const;
    /// The element that this one is in; empty for the root.
    [[nodiscard]] XmlNode parent() const;
    /// The next element below `top` in document order: the first one directly below this one, else
    /// the one that follows its end. Empty at the end of `top`.
    [[nodiscard]] XmlNode nextBelow(const XmlNode& top) const;
    /// All elements below with this name, as the path ".//name" finds them.
    [[nodiscard]] std::vector<XmlNode> descendants(std::string_view name) const;
    /// The first of them, else an empty handle.
    [[nodiscard]] XmlNode firstDescendant(std::string_view name) const;
    /// Adds a copy of the element, with all below it, as last child. Its nodes and the bytes of its
    /// texts are subtracted from `room`; when they are more, `room` is used up and
    /// nothing is added. Gives the copy.
    XmlNode addCopyOf(const XmlNode& element, std::size_t& room);
    /// Line of the element in the text, from 1; 0 of an empty handle.
    [[nodiscard]] int line() const;

    /// All nodes that the path finds from here, in document order.
    [[nodiscard]] std::vector<XmlNode> nodesForXPath(const XmlPath& path) const;
    /// The first of them, else an empty handle.
    [[nodiscard]] XmlNode firstForXPath(const XmlPath& path) const;

    friend bool operator==(const XmlNode&, const XmlNode&) = default;

private:
    _xmlNode* mNode = nullptr;
};

/// An XPath 1.0 expression, compiled once; a wrong one finds nothing. Safe to share as a
/// function-local static.
class XmlPath {
public:
    /// Compiles the expression; it is not kept.
    XmlPath(const char* path);  // NOLINT: a path is written as text where it is used
    /// The same.
    explicit XmlPath(const std::string& path) : XmlPath(path.c_str()) {}

private:
    friend class XmlNode;
    std::shared_ptr<_xmlXPathCompExpr> mCompiled;
};

/// A whole XML document as a tree. The same limits hold as for XmlStreamParser: nothing outside the
/// bytes is read. In a library that was built with BRINDLE_SCORES=OFF every text is a fault, here
/// and there.
class XmlDocument {
public:
    /// The tree of the bytes, or the first fault that makes them not well-formed.
    [[nodiscard]] static std::variant<XmlDocument, XmlError> FromBytes(std::string_view bytes);

    /// The element that all others are in.
    [[nodiscard]] XmlNode rootElement() const;

private:
    explicit XmlDocument(_xmlDoc* document);

    std::shared_ptr<_xmlDoc> mDocument;
};

}  // namespace brindle
