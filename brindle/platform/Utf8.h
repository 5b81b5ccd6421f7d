// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace brindle {

/// The number of bytes of the character that `text` begins with, 1 to 4; 0 when the bytes are no
/// UTF-8 (overlong forms, surrogates and numbers beyond U+10FFFF included) or the text is empty.
[[nodiscard]] std::size_t Utf8Length(std::string_view text);

/// The number of a character in Unicode. `character` is a whole one, of the length that Utf8Length
/// tells.
[[nodiscard]] std::uint32_t CodePointOf(std::string_view character);

/// Whether a character disturbs what shows it: control characters, also U+0080 to U+009F, which
/// some terminals obey; the ends of lines U+2028 and U+2029; those that turn the direction of what
/// follows (U+202A to U+202E, U+2066 to U+2069); U+FFFE and U+FFFF, which XML does not allow.
[[nodiscard]] bool IsUnprintable(std::string_view character);

/// Whether a character begins with this byte: all of UTF-8 but the bytes inside of characters.
[[nodiscard]] constexpr bool BeginsUtf8Character(char byte) {
    return (static_cast<unsigned char>(byte) & 0xC0U) != 0x80U;
}

/// The number of characters; of bytes that are no UTF-8 it counts those that could begin one.
[[nodiscard]] constexpr std::size_t CountUtf8Characters(std::string_view text) {
    std::size_t count = 0;
    for (const char byte : text) {
        if (BeginsUtf8Character(byte)) ++count;
    }
    return count;
}

}  // namespace brindle
