// SPDX-License-Identifier: MIT
#include "brindle/platform/JsonValue.h"

#include <limits>
#include <nlohmann/json.hpp>

namespace brindle::JsonValue {

std::optional<std::int32_t> Integer(const nlohmann::json& dictionary, const char* key) {
    // Every 32-bit integer is a double, so nothing is lost on the way.
    const std::optional<double> number = Number(dictionary, key);
    constexpr double beyond = std::numeric_limits<std::int32_t>::max() + 1.0;
    if (!number || !(*number > -beyond - 1.0 && *number < beyond)) return std::nullopt;
    return static_cast<std::int32_t>(*number);
}

std::optional<double> Number(const nlohmann::json& dictionary, const char* key) {
    const auto member = dictionary.find(key);
    if (member == dictionary.end() || !member->is_number()) return std::nullopt;
    return member->get<double>();
}

}  // namespace brindle::JsonValue
