// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <nlohmann/json_fwd.hpp>
#include <optional>
#include <string_view>

namespace brindle {

// What a dictionary, a JSON object, holds under a key. Nothing when `dictionary` is no object, the
// key is missing, or the value is of another type.

/// A number without its fraction, limited to 32 bits, or the integer at the start of a text (0 if
/// there is none).
[[nodiscard]] std::optional<std::int32_t> IntegerIn(const nlohmann::json& dictionary,
                                                    const char* key);
/// A number with its fraction; a text is none.
[[nodiscard]] std::optional<double> NumberIn(const nlohmann::json& dictionary, const char* key);
/// A text; valid as long as the dictionary is.
[[nodiscard]] std::optional<std::string_view> TextIn(const nlohmann::json& dictionary,
                                                     const char* key);

}  // namespace brindle
