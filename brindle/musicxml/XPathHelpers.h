// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/XmlDocument.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace brindle {

// The first node that an XPath finds from a node, read as a value; the default when there is none.

[[nodiscard]] std::optional<std::string> NSStringValueForXPath(
    const XmlNode& node, const XmlPath& path, std::optional<std::string> defaultValue);
[[nodiscard]] std::string StringValueForXPath(const XmlNode& node, const XmlPath& path,
                                              std::string_view defaultValue);
/// The letters A to Z in lower case.
[[nodiscard]] std::string LowercaseString(std::string text);
/// In lower case; the default as it stands.
[[nodiscard]] std::string LowercaseStringValueForXPath(const XmlNode& node, const XmlPath& path,
                                                       std::string_view defaultValue);
[[nodiscard]] std::int32_t IntValueForXPath(const XmlNode& node, const XmlPath& path,
                                            std::int32_t defaultValue);
[[nodiscard]] double DoubleValueForXPath(const XmlNode& node, const XmlPath& path,
                                         double defaultValue);
/// An empty handle when there is none.
[[nodiscard]] XmlNode XMLElementForXPath(const XmlNode& node, const XmlPath& path);
[[nodiscard]] bool XPathExists(const XmlNode& node, const XmlPath& path);

}  // namespace brindle
