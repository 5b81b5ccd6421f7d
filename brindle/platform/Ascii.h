// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <string_view>

/// Questions about single bytes of a text, and cutting at them, the same in every locale. Bytes of
/// characters beyond ASCII are neither letters nor white space and stay as they are.
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

inline constexpr std::string_view kWhiteSpace = " \t\n\v\f\r";

[[nodiscard]] constexpr bool IsWhiteSpace(char c) {
    return kWhiteSpace.find(c) != kWhiteSpace.npos;
}
/// The text from its first byte that is no white space.
[[nodiscard]] constexpr std::string_view TrimmedInFront(std::string_view text) {
    return text.substr(std::min(text.find_first_not_of(kWhiteSpace), text.size()));
}
[[nodiscard]] constexpr std::string_view Trimmed(std::string_view text) {
    text = TrimmedInFront(text);
    return text.substr(0, text.find_last_not_of(kWhiteSpace) + 1);
}
/// Whether `text` begins with `word`; then it goes on behind it.
constexpr bool TakePrefix(std::string_view& text, std::string_view word) {
    if (!text.starts_with(word)) return false;
    text.remove_prefix(word.size());
    return true;
}

}  // namespace brindle::Ascii
