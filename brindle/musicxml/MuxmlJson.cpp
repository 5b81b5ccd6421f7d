// SPDX-License-Identifier: MIT
#include "brindle/musicxml/MuxmlJson.h"

#include "brindle/platform/JsonString.h"

#include <fmt/format.h>

#include <cmath>
#include <iterator>

namespace brindle {

void CMuxmlJson::AppendName(std::string& text, std::string_view name) {
    if (!text.ends_with('{')) text += ',';
    fmt::format_to(std::back_inserter(text), "\"{}\":", name);
}

void CMuxmlJson::Append(std::string& text, bool value) {
    text += value ? "true" : "false";
}

void CMuxmlJson::Append(std::string& text, std::int64_t value) {
    fmt::format_to(std::back_inserter(text), "{}", value);
}

void CMuxmlJson::Append(std::string& text, std::uint64_t value) {
    fmt::format_to(std::back_inserter(text), "{}", value);
}

void CMuxmlJson::Append(std::string& text, double value) {
    if (std::isfinite(value)) {
        fmt::format_to(std::back_inserter(text), "{}", value);
    } else {
        text += "null";
    }
}

void CMuxmlJson::Append(std::string& text, std::string_view value) {
    text += JsonString(value);
}

}  // namespace brindle
