// SPDX-License-Identifier: MIT
#include "brindle/platform/internal/XmlSafety.h"

#include <libxml/SAX2.h>

namespace brindle::xml {

namespace {

// An external entity is never declared, so that a reference to it finds nothing to load.
void DeclareInternalEntity(void* context, const xmlChar* name, int type, const xmlChar* publicId,
                           const xmlChar* systemId, xmlChar* content) {
    const bool isInternal =
        type == XML_INTERNAL_GENERAL_ENTITY || type == XML_INTERNAL_PARAMETER_ENTITY;
    if (isInternal) xmlSAX2EntityDecl(context, name, type, publicId, systemId, content);
}

void IgnoreExternalSubset(void*, const xmlChar*, const xmlChar*, const xmlChar*) {}

xmlParserInputPtr ResolveNothing(void*, const xmlChar*, const xmlChar*) {
    return nullptr;
}

}  // namespace

void RefuseOutsideWorld(xmlSAXHandler& handler) {
    handler.entityDecl = DeclareInternalEntity;
    handler.externalSubset = IgnoreExternalSubset;
    handler.resolveEntity = ResolveNothing;
}

XmlError ErrorFrom(const xmlError& error) {
    std::string text = error.message == nullptr ? "unknown XML error" : error.message;
    while (!text.empty() && (text.back() == '\n' || text.back() == ' ')) text.pop_back();
    return {error.code, text, error.line, error.int2};
}

}  // namespace brindle::xml
