// SPDX-License-Identifier: MIT
#include "brindle/musicxml/MuxmlJson.h"

#include <fmt/format.h>

#include <cmath>
#include <iterator>
#include <nlohmann/json.hpp>

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
    text += nlohmann::json(value).dump(-1, ' ', false, nlohmann::json::error_handler_t::replace);
}

}  // namespace brindle
