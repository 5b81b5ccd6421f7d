// SPDX-License-Identifier: MIT
#include "brindle/musicxml/MuxmlJson.h"

#include "brindle/platform/JsonString.h"

#include <fmt/format.h>

#include <cmath>

namespace brindle {

void CMuxmlJson::AppendName(std::string& text, std::string_view name) {
    if (!text.ends_with('{')) text += ',';
    text += '"';
    text += name;
    text += "\":";
}

void CMuxmlJson::Append(std::string& text, bool value) {
    text += value ? "true" : "false";
}

void CMuxmlJson::Append(std::string& text, std::int64_t value) {
    text += fmt::format_int(value).c_str();
}

void CMuxmlJson::Append(std::string& text, std::uint64_t value) {
    text += fmt::format_int(value).c_str();
}

void CMuxmlJson::Append(std::string& text, double value) {
    if (std::isfinite(value)) {
        text += fmt::format("{}", value);
    } else {
        text += "null";
    }
}

void CMuxmlJson::Append(std::string& text, std::string_view value) {
    text += JsonString(value);
}

}  // namespace brindle
