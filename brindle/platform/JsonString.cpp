// SPDX-License-Identifier: MIT
#include "brindle/platform/JsonString.h"

#include "brindle/platform/Utf8.h"

#include <fmt/format.h>

#include <algorithm>
#include <nlohmann/json.hpp>

namespace brindle {
namespace {

bool IsPlainInJson(char c) {
    return c >= 0x20 && c < 0x7F && c != '"' && c != '\\';
}

/// Of JSON in UTF-8 on one line: what is unprintable there stands in a string.
std::string WithEscapes(std::string json) {
    if (std::all_of(json.begin(), json.end(), [](char c) { return c >= 0x20 && c < 0x7F; })) {
        return json;
    }
    std::string escaped;
    escaped.reserve(json.size());
    for (std::string_view rest = json; !rest.empty();) {
        const std::string_view character = rest.substr(0, Utf8Length(rest));
        if (IsUnprintable(character)) {
            escaped += fmt::format("\\u{:04x}", CodePointOf(character));
        } else {
            escaped += character;
        }
        rest.remove_prefix(character.size());
    }
    return escaped;
}

template <class Value>
std::string OnOneLine(const Value& value) {
    return WithEscapes(value.dump(-1, ' ', false, Value::error_handler_t::replace));
}

}  // namespace

std::string JsonString(std::string_view text) {
    if (std::all_of(text.begin(), text.end(), IsPlainInJson)) return fmt::format("\"{}\"", text);
    return OnOneLine(nlohmann::json(text));
}

std::string DumpJson(const nlohmann::json& value) {
    return OnOneLine(value);
}

std::string DumpJson(const nlohmann::ordered_json& value) {
    return OnOneLine(value);
}

nlohmann::json ParseJson(std::string_view text) {
    return nlohmann::json::parse(text, nullptr, false);
}

}  // namespace brindle
