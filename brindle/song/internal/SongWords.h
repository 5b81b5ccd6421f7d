// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <string>
#include <string_view>

/// Cutting texts of songs at white space.
namespace brindle::SongText {

inline constexpr std::string_view kBlanks = " \t\r\v\f\n";

[[nodiscard]] constexpr bool IsBlank(char c) {
    return kBlanks.find(c) != kBlanks.npos;
}
[[nodiscard]] constexpr bool IsDigit(char c) {
    return c >= '0' && c <= '9';
}

[[nodiscard]] constexpr std::string_view WithoutBlanksInFront(std::string_view text) {
    return text.substr(std::min(text.find_first_not_of(kBlanks), text.size()));
}

[[nodiscard]] constexpr std::string_view Trimmed(std::string_view text) {
    text = WithoutBlanksInFront(text);
    return text.substr(0, text.find_last_not_of(kBlanks) + 1);
}

/// Letters of ASCII in lower case.
[[nodiscard]] inline std::string Lower(std::string_view text) {
    std::string lower(text);
    std::transform(lower.begin(), lower.end(), lower.begin(), [](char c) {
        return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
    });
    return lower;
}

/// The first word; `text` goes on behind it and the blanks that follow.
constexpr std::string_view TakeWordOf(std::string_view& text) {
    text = WithoutBlanksInFront(text);
    const std::string_view word = text.substr(0, text.find_first_of(kBlanks));
    text = WithoutBlanksInFront(text.substr(word.size()));
    return word;
}

/// The first line without its end; `text` goes on behind it.
constexpr std::string_view TakeLine(std::string_view& text) {
    const std::string_view line = text.substr(0, text.find('\n'));
    text.remove_prefix(std::min(line.size() + 1, text.size()));
    return line;
}

}  // namespace brindle::SongText
