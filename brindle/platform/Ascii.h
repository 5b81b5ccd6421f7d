// SPDX-License-Identifier: MIT
#pragma once

/// Questions about single bytes of a text, the same in every locale. Bytes of characters beyond
/// ASCII are no letters and stay as they are.
namespace brindle::Ascii {

[[nodiscard]] constexpr bool IsDigit(char c) {
    return c >= '0' && c <= '9';
}
[[nodiscard]] constexpr bool IsSmallLetter(char c) {
    return c >= 'a' && c <= 'z';
}
[[nodiscard]] constexpr bool IsCapital(char c) {
    return c >= 'A' && c <= 'Z';
}
[[nodiscard]] constexpr bool IsLetter(char c) {
    return IsSmallLetter(c) || IsCapital(c);
}
[[nodiscard]] constexpr char ToLower(char c) {
    return IsCapital(c) ? static_cast<char>(c - 'A' + 'a') : c;
}
[[nodiscard]] constexpr char ToUpper(char c) {
    return IsSmallLetter(c) ? static_cast<char>(c - 'a' + 'A') : c;
}

}  // namespace brindle::Ascii
