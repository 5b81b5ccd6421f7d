// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <string_view>

/// Questions about single bytes of a text, and cutting at them, the same in every locale. Bytes of
/// characters beyond ASCII are neither letters nor white space and stay as they are.
namespace brindle::Ascii {

/// 0 to 9.
[[nodiscard]] constexpr bool IsDigit(char c) {
    return c >= '0' && c <= '9';
}
/// a to z.
[[nodiscard]] constexpr bool IsSmallLetter(char c) {
    return c >= 'a' && c <= 'z';
}
/// A to Z.
[[nodiscard]] constexpr bool IsCapital(char c) {
    return c >= 'A' && c <= 'Z';
}
/// A to Z and a to z.
[[nodiscard]] constexpr bool IsLetter(char c) {
    return IsSmallLetter(c) || IsCapital(c);
}
/// The small letter of a capital one; any other byte stays.
[[nodiscard]] constexpr char ToLower(char c) {
    return IsCapital(c) ? static_cast<char>(c - 'A' + 'a') : c;
}
/// The capital letter of a small one; any other byte stays.
[[nodiscard]] constexpr char ToUpper(char c) {
    return IsSmallLetter(c) ? static_cast<char>(c - 'a' + 'A') : c;
}

/// The bytes that are white space: blank, tab, line feed, vertical tab, form feed, carriage return.
inline constexpr std::string_view kWhiteSpace = " \t\n\v\f\r";

/// Whether the byte is one of kWhiteSpace.
[[nodiscard]] constexpr bool IsWhiteSpace(char c) {
    return kWhiteSpace.find(c) != kWhiteSpace.npos;
}
/// The text from its first byte that is no white space.
[[nodiscard]] constexpr std::string_view TrimmedInFront(std::string_view text) {
    return text.substr(std::min(text.find_first_not_of(kWhiteSpace), text.size()));
}
/// The text without white space at both its ends.
[[nodiscard]] constexpr std::string_view Trimmed(std::string_view text) {
    text = TrimmedInFront(text);
    return text.substr(0, text.find_last_not_of(kWhiteSpace) + 1);
}
/// Whether `text` begins with `word`; then cuts it off there.
constexpr bool TakePrefix(std::string_view& text, std::string_view word) {
    if (!text.starts_with(word)) return false;
    text.remove_prefix(word.size());
    return true;
}

}  // namespace brindle::Ascii
