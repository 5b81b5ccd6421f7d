// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace brindle {

// The number at the start of a text, behind white space, whatever the program's locale is. What
// follows the number is ignored.

/// A sign and decimal digits. Without digits it is 0, and beyond 32 bits the nearest limit.
[[nodiscard]] std::int32_t ReadInteger(std::string_view text);

/// As `atof` reads it in the "C" locale: 0.0 where there is none, infinity where it is too great.
[[nodiscard]] double ReadDouble(const std::string& text);

/// A sign, decimal digits, a point and an exponent; no hexadecimal form and no words such as "nan".
/// Without digits it is 0.
[[nodiscard]] double ReadDecimal(std::string_view text);

}  // namespace brindle
