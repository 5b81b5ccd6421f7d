// SPDX-License-Identifier: MIT
#include "brindle/platform/DictionaryValues.h"

#include "brindle/platform/ReadNumber.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <nlohmann/json.hpp>

namespace brindle {

namespace {

constexpr std::int32_t kMin = std::numeric_limits<std::int32_t>::min();
constexpr std::int32_t kMax = std::numeric_limits<std::int32_t>::max();

/// The value under the key, null when there is none.
const nlohmann::json* ValueIn(const nlohmann::json& dictionary, const char* key) {
    if (!dictionary.is_object()) return nullptr;
    const auto it = dictionary.find(key);
    return it == dictionary.end() ? nullptr : &*it;
}

std::int32_t Limited(const nlohmann::json& number) {
    if (number.is_number_float()) {
        if (std::isnan(number.get<double>())) return 0;
        return static_cast<std::int32_t>(
            std::clamp<double>(number.get<double>(), double{kMin}, double{kMax}));
    }
    if (number.is_number_unsigned()) {
        constexpr auto kMaxUnsigned = static_cast<std::uint64_t>(kMax);
        return static_cast<std::int32_t>(std::min(number.get<std::uint64_t>(), kMaxUnsigned));
    }
    return static_cast<std::int32_t>(
        std::clamp<std::int64_t>(number.get<std::int64_t>(), kMin, kMax));
}

}  // namespace

std::optional<std::int32_t> IntegerIn(const nlohmann::json& dictionary, const char* key) {
    const nlohmann::json* value = ValueIn(dictionary, key);
    if (value == nullptr) return std::nullopt;
    if (value->is_string()) return ReadInteger(value->get_ref<const std::string&>());
    if (!value->is_number()) return std::nullopt;
    return Limited(*value);
}

std::optional<double> NumberIn(const nlohmann::json& dictionary, const char* key) {
    const nlohmann::json* value = ValueIn(dictionary, key);
    if (value == nullptr || !value->is_number()) return std::nullopt;
    return value->get<double>();
}

std::optional<std::string_view> TextIn(const nlohmann::json& dictionary, const char* key) {
    const nlohmann::json* value = ValueIn(dictionary, key);
    if (value == nullptr || !value->is_string()) return std::nullopt;
    return value->get_ref<const std::string&>();
}

}  // namespace brindle
