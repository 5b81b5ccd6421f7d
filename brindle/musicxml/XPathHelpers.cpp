// SPDX-License-Identifier: MIT
#include "brindle/musicxml/XPathHelpers.h"

#include "brindle/platform/Ascii.h"
#include "brindle/platform/ReadNumber.h"

#include <algorithm>

namespace brindle {

std::optional<std::string> NSStringValueForXPath(const XmlNode& node, const XmlPath& path,
                                                 std::optional<std::string> defaultValue) {
    const XmlNode found = node.firstForXPath(path);
    return found ? found.stringValue() : std::move(defaultValue);
}

std::string StringValueForXPath(const XmlNode& node, const XmlPath& path,
                                std::string_view defaultValue) {
    const XmlNode found = node.firstForXPath(path);
    return found ? found.stringValue() : std::string(defaultValue);
}

std::string LowercaseString(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(), Ascii::ToLower);
    return text;
}

std::string LowercaseStringValueForXPath(const XmlNode& node, const XmlPath& path,
                                         std::string_view defaultValue) {
    const XmlNode found = node.firstForXPath(path);
    return found ? LowercaseString(found.stringValue()) : std::string(defaultValue);
}

std::int32_t IntValueForXPath(const XmlNode& node, const XmlPath& path, std::int32_t defaultValue) {
    const XmlNode found = node.firstForXPath(path);
    return found ? ReadInteger(found.stringValue()) : defaultValue;
}

double DoubleValueForXPath(const XmlNode& node, const XmlPath& path, double defaultValue) {
    const XmlNode found = node.firstForXPath(path);
    return found ? ReadDecimal(found.stringValue()) : defaultValue;
}

XmlNode XMLElementForXPath(const XmlNode& node, const XmlPath& path) {
    return node.firstForXPath(path);
}

bool XPathExists(const XmlNode& node, const XmlPath& path) {
    return static_cast<bool>(node.firstForXPath(path));
}

}  // namespace brindle
