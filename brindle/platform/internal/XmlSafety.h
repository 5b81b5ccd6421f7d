// SPDX-License-Identifier: MIT
#pragma once

// Internal to platform/: what both XML readers do so that a document reaches nothing outside
// itself.

#include "brindle/platform/XmlError.h"

#include <libxml/parser.h>

namespace brindle::xml {

/// Options of every parse: entities of the document itself are expanded, the network is never used.
inline constexpr int kOptions = XML_PARSE_NOENT | XML_PARSE_NONET;

/// Makes a parser that forgets every external entity and never loads a document type.
void RefuseOutsideWorld(xmlSAXHandler& handler);

/// The message without its line end, and the place.
XmlError ErrorFrom(const xmlError& error);

}  // namespace brindle::xml
