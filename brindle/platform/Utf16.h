// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace brindle {

/// UTF-8 text as the bytes of UTF-16: the byte-order mark FE FF, then big-endian units. Nothing for
/// bytes that are no UTF-8.
[[nodiscard]] std::optional<std::string> Utf16FromUtf8(std::string_view text);

/// The bytes of UTF-16 as UTF-8. A byte-order mark tells the order and is not part of the text;
/// without one the order is big-endian. Nothing for an odd number of bytes and for a surrogate
/// without its other half.
[[nodiscard]] std::optional<std::string> Utf8FromUtf16(std::string_view bytes);

}  // namespace brindle
