// SPDX-License-Identifier: MIT
#include "cli/Json.h"

#include "cli/Names.h"

#include "brindle/analysis/Positions.h"

#include <fmt/format.h>

#include <cmath>
#include <sstream>

namespace brindle::cli {
namespace {

constexpr std::size_t kLineWidth = 120;

// Bytes that are no UTF-8 become U+FFFD.
std::string Compact(const Json& json) {
    return json.dump(-1, ' ', false, Json::error_handler_t::replace);
}

void Append(std::string& text, const Json& json, std::size_t indent) {
    const std::string compact = Compact(json);
    if (!json.is_structured() || json.empty() || indent + compact.size() <= kLineWidth) {
        text += compact;
        return;
    }
    const bool isObject = json.is_object();
    const std::string margin(indent + 2, ' ');
    text += isObject ? '{' : '[';
    const char* separator = "\n";
    for (const auto& [key, value] : json.items()) {
        text += separator + margin;
        separator = ",\n";
        if (isObject) text += Compact(key) + ": ";
        Append(text, value, indent + 2);
    }
    text += '\n' + std::string(indent, ' ');
    text += isObject ? '}' : ']';
}

}  // namespace

Json KeyEnhToJson(const CKeyEnh& keyEnh) {
    if (keyEnh.IsUndef()) return nullptr;
    std::ostringstream enh;
    enh << keyEnh.mEnh;
    return {{"Name", KeyName(keyEnh)}, {"KeyNr", keyEnh.mKeyNr}, {"Enh", enh.str()}};
}

Json KeyEnhsToJson(const std::vector<CKeyEnh>& keys) {
    Json list = Json::array();
    for (const CKeyEnh& key : keys) list.push_back(KeyEnhToJson(key));
    return list;
}

Json IntervalsToJson(CSemitones semitones) {
    Json intervals = Json::array();
    for (int intvl = 0; intvl < 12; ++intvl) {
        if (semitones.HasIntvl(intvl)) intervals.push_back(intvl);
    }
    return intervals;
}

Json NumberToJson(double number) {
    if (number == kPosUndef || !std::isfinite(number)) return nullptr;
    return number;
}

std::string JsonText(const Json& json) {
    std::string text;
    Append(text, json, 0);
    text += '\n';
    return text;
}

}  // namespace brindle::cli
