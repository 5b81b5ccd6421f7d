// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <nlohmann/json_fwd.hpp>
#include <optional>

/// Reading numbers from dictionaries that come from outside: a value of the wrong kind, or one out
/// of range, counts as missing, and so does every value of a dictionary that is none.
namespace brindle::JsonValue {

/// A number cut to a whole one.
[[nodiscard]] std::optional<std::int32_t> Integer(const nlohmann::json& dictionary,
                                                  const char* key);
[[nodiscard]] std::optional<double> Number(const nlohmann::json& dictionary, const char* key);

}  // namespace brindle::JsonValue
