// SPDX-License-Identifier: MIT
#include "brindle/platform/XmlDocument.h"

#include "brindle/platform/internal/XmlSafety.h"

#include <libxml/tree.h>
#include <libxml/xpath.h>
#include <libxml/xpathInternals.h>

#include <limits>
#include <new>
#include <utility>

namespace brindle {

namespace {

std::string_view TextInTree(const xmlChar* text) {
    return text == nullptr ? std::string_view() : reinterpret_cast<const char*>(text);
}

// Where there is a text to be had, none at all means that memory was short.
std::string TakeText(xmlChar* text) {
    if (text == nullptr) throw std::bad_alloc();
    const std::unique_ptr<xmlChar, decltype(xmlFree)> owner(text, xmlFree);
    return std::string(TextInTree(text));
}

xmlNodePtr ElementFrom(xmlNodePtr node) {
    while (node != nullptr && node->type != XML_ELEMENT_NODE) node = node->next;
    return node;
}

// Nodes and bytes of the texts and attributes of a node and all below it. Stops soon after `limit`.
std::size_t SizeOf(const xmlNode* node, std::size_t limit) {
    std::size_t size = 1;
    if (node->type != XML_ELEMENT_NODE && node->content != nullptr) {
        size += TextInTree(node->content).size();
    }
    if (node->type == XML_ELEMENT_NODE) {
        for (const xmlAttr* attribute = node->properties; attribute != nullptr;
             attribute = attribute->next) {
            for (const xmlNode* text = attribute->children; text != nullptr; text = text->next) {
                size += TextInTree(text->content).size() + 1;
            }
        }
    }
    for (const xmlNode* child = node->children; child != nullptr && size <= limit;
         child = child->next) {
        size += SizeOf(child, limit - size);
    }
    return size;
}

using XPathContext = std::unique_ptr<xmlXPathContext, decltype(&xmlXPathFreeContext)>;
using XPathResult = std::unique_ptr<xmlXPathObject, decltype(&xmlXPathFreeObject)>;

// Short memory and a wrong path both have no result; only a wrong path is always told as an error.
struct CPathErrors {
    bool mWasMemoryShort = false;
    bool mIsWrong = false;

    static void Hear(void* self, xmlErrorPtr error) {
        const bool isShort = error->code == XML_ERR_NO_MEMORY ||
                             error->code == int{XML_XPATH_EXPRESSION_OK} + XPATH_MEMORY_ERROR;
        auto& errors = *static_cast<CPathErrors*>(self);
        (isShort ? errors.mWasMemoryShort : errors.mIsWrong) = true;
    }
};

/// Calls `step` with a context for paths. Throws when memory was short.
template <class Step>
auto WithPathContext(xmlDocPtr document, Step step) {
    const xml::CMemoryWatch watch;
    CPathErrors errors;
    const XPathContext context(xmlXPathNewContext(document), xmlXPathFreeContext);
    if (!context) throw std::bad_alloc();
    context->error = CPathErrors::Hear;
    context->userData = &errors;
    auto result = step(context.get());
    if (errors.mWasMemoryShort || (!result && !errors.mIsWrong)) throw std::bad_alloc();
    watch.Check();
    return result;
}

XPathResult Evaluate(xmlXPathCompExpr* compiled, xmlNodePtr node) {
    if (compiled == nullptr || node == nullptr) return {nullptr, xmlXPathFreeObject};
    return WithPathContext(node->doc, [&](xmlXPathContextPtr context) {
        context->node = node;
        return XPathResult(xmlXPathCompiledEval(compiled, context), xmlXPathFreeObject);
    });
}

}  // namespace

std::string_view XmlNode::name() const {
    return mNode == nullptr ? std::string_view() : TextInTree(mNode->name);
}

std::string XmlNode::stringValue() const {
    if (mNode == nullptr) return {};
    const xml::CMemoryWatch watch;
    std::string text = TakeText(xmlNodeGetContent(mNode));
    watch.Check();
    return text;
}

std::optional<std::string> XmlNode::attribute(std::string_view name) const {
    if (mNode == nullptr || mNode->type != XML_ELEMENT_NODE) return std::nullopt;
    for (xmlAttrPtr attribute = mNode->properties; attribute != nullptr;
         attribute = attribute->next) {
        if (TextInTree(attribute->name) != name) continue;
        if (attribute->children == nullptr) return std::string();
        const xml::CMemoryWatch watch;
        std::string value = TakeText(xmlNodeListGetString(mNode->doc, attribute->children, 1));
        watch.Check();
        return value;
    }
    return std::nullopt;
}

std::vector<XmlNode> XmlNode::children() const {
    std::vector<XmlNode> result;
    for (XmlNode node = firstChild(); node; node = node.nextSibling()) result.push_back(node);
    return result;
}

XmlNode XmlNode::child(std::string_view name) const {
    XmlNode node = firstChild();
    while (node && node.name() != name) node = node.nextSibling();
    return node;
}

XmlNode XmlNode::firstChild() const {
    if (mNode == nullptr || mNode->type != XML_ELEMENT_NODE) return {};
    return XmlNode(ElementFrom(mNode->children));
}

XmlNode XmlNode::nextSibling() const {
    return mNode == nullptr ? XmlNode() : XmlNode(ElementFrom(mNode->next));
}

XmlNode XmlNode::parent() const {
    if (mNode == nullptr || mNode->parent == nullptr) return {};
    return XmlNode(mNode->parent->type == XML_ELEMENT_NODE ? mNode->parent : nullptr);
}

XmlNode XmlNode::nextBelow(const XmlNode& top) const {
    if (const XmlNode child = firstChild()) return child;
    for (xmlNodePtr node = mNode; node != nullptr && node != top.mNode; node = node->parent) {
        if (const xmlNodePtr next = ElementFrom(node->next)) return XmlNode(next);
    }
    return {};
}

std::vector<XmlNode> XmlNode::descendants(std::string_view name) const {
    std::vector<XmlNode> found;
    for (XmlNode node = firstChild(); node; node = node.nextBelow(*this)) {
        if (node.name() == name) found.push_back(node);
    }
    return found;
}

XmlNode XmlNode::firstDescendant(std::string_view name) const {
    XmlNode node = firstChild();
    while (node && node.name() != name) node = node.nextBelow(*this);
    return node;
}

XmlNode XmlNode::addCopyOf(const XmlNode& element, std::size_t& room) {
    if (mNode == nullptr || element.mNode == nullptr || room == 0) return {};
    const std::size_t size = SizeOf(element.mNode, room);
    if (size > room) {
        room = 0;
        return {};
    }
    const xml::CMemoryWatch watch;
    const xmlNodePtr copy = xmlDocCopyNode(element.mNode, mNode->doc, 1);
    if (copy == nullptr) throw std::bad_alloc();
    const XmlNode added(xmlAddChild(mNode, copy));
    watch.Check();
    room -= size;
    return added;
}

int XmlNode::line() const {
    return mNode == nullptr ? 0 : static_cast<int>(xmlGetLineNo(mNode));
}

std::vector<XmlNode> XmlNode::nodesForXPath(const XmlPath& path) const {
    std::vector<XmlNode> nodes;
    const XPathResult result = Evaluate(path.mCompiled.get(), mNode);
    if (!result || result->nodesetval == nullptr) return nodes;
    xmlXPathNodeSetSort(result->nodesetval);
    nodes.reserve(static_cast<std::size_t>(result->nodesetval->nodeNr));
    for (int i = 0; i < result->nodesetval->nodeNr; ++i) {
        const xmlNodePtr found = result->nodesetval->nodeTab[i];
        if (found->type != XML_NAMESPACE_DECL) nodes.emplace_back(found);
    }
    return nodes;
}

XmlNode XmlNode::firstForXPath(const XmlPath& path) const {
    const std::vector<XmlNode> nodes = nodesForXPath(path);
    return nodes.empty() ? XmlNode() : nodes.front();
}

XmlPath::XmlPath(const char* path) {
    const auto free = [](xmlXPathCompExpr* compiled) {
        if (compiled != nullptr) xmlXPathFreeCompExpr(compiled);
    };
    mCompiled = WithPathContext(nullptr, [&](xmlXPathContextPtr context) {
        return std::shared_ptr<xmlXPathCompExpr>(
            xmlXPathCtxtCompile(context, reinterpret_cast<const xmlChar*>(path)), free);
    });
}

XmlDocument::XmlDocument(_xmlDoc* document) : mDocument(document, xmlFreeDoc) {}

std::variant<XmlDocument, XmlError> XmlDocument::FromBytes(std::string_view bytes) {
    if (bytes.size() > std::numeric_limits<int>::max()) {
        return XmlError{XML_ERR_DOCUMENT_END, "Document too long", 1, 1};
    }
    xml::CParse parse(bytes);
    if (auto error = parse.Run()) return *std::move(error);
    return XmlDocument(parse.TakeDocument());
}

XmlNode XmlDocument::rootElement() const {
    return XmlNode(xmlDocGetRootElement(mDocument.get()));
}

}  // namespace brindle
