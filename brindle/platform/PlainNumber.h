// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string_view>

/// Numbers at the front of a text, read the same whatever the locale: white space, a sign, decimal
/// digits; what follows is not looked at, and a text that begins with no number is 0.
namespace brindle::PlainNumber {

/// Numbers beyond 32 bits stop at the limits.
[[nodiscard]] std::int32_t ReadInteger(std::string_view text);
/// Also a point and an exponent; no hexadecimal form, no words for infinity.
[[nodiscard]] double ReadDouble(std::string_view text);

}  // namespace brindle::PlainNumber
