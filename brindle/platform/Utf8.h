// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string_view>

namespace brindle {

/// The number of bytes of the character that `text` begins with, 1 to 4; 0 when the bytes are no
/// UTF-8 (overlong forms, surrogates and numbers beyond U+10FFFF included) or the text is empty.
[[nodiscard]] std::size_t Utf8Length(std::string_view text);

}  // namespace brindle
