// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/XmlDocument.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace brindle {

// The first node that an XPath finds from a node, read as a value; the default when there is none.

/// All text below it; the default may be nothing.
[[nodiscard]] std::optional<std::string> NSStringValueForXPath(
    const XmlNode& node, const XmlPath& path, std::optional<std::string> defaultValue);
/// All text below it.
[[nodiscard]] std::string StringValueForXPath(const XmlNode& node, const XmlPath& path,
                                              std::string_view defaultValue);
/// The letters A to Z in lower case.
[[nodiscard]] std::string LowercaseString(std::string text);
/// In lower case; the default as it stands.
[[nodiscard]] std::string LowercaseStringValueForXPath(const XmlNode& node, const XmlPath& path,
                                                       std::string_view defaultValue);
/// The number that its text begins with, 0 for a text that begins with none.
[[nodiscard]] std::int32_t IntValueForXPath(const XmlNode& node, const XmlPath& path,
                                            std::int32_t defaultValue);
/// Likewise.
[[nodiscard]] double DoubleValueForXPath(const XmlNode& node, const XmlPath& path,
                                         double defaultValue);
/// An empty handle when there is none.
[[nodiscard]] XmlNode XMLElementForXPath(const XmlNode& node, const XmlPath& path);
/// Whether there is one.
[[nodiscard]] bool XPathExists(const XmlNode& node, const XmlPath& path);

}  // namespace brindle
