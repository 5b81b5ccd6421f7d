// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <nlohmann/json_fwd.hpp>
#include <optional>
#include <string_view>

namespace brindle {

/// The integer at the start of `text`: white space, a sign, digits. Whatever follows is ignored.
/// Without digits it is 0, and beyond 32 bits the nearest limit.
[[nodiscard]] std::int32_t IntegerAtStartOf(std::string_view text);

// What a dictionary, a JSON object, holds under a key. Nothing when `dictionary` is no object, the
// key is missing, or the value is of another type.

/// A number without its fraction, or the integer at the start of a text.
[[nodiscard]] std::optional<std::int32_t> IntegerIn(const nlohmann::json& dictionary,
                                                    const char* key);
[[nodiscard]] std::optional<double> NumberIn(const nlohmann::json& dictionary, const char* key);
/// A text; valid as long as the dictionary is.
[[nodiscard]] std::optional<std::string_view> TextIn(const nlohmann::json& dictionary,
                                                     const char* key);

}  // namespace brindle
