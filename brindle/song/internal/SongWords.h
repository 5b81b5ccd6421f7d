// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/Ascii.h"

#include <algorithm>
#include <string>
#include <string_view>

/// Cutting texts of songs at white space.
namespace brindle::SongText {

using Ascii::IsDigit;
using Ascii::Trimmed;
using Ascii::TrimmedInFront;

[[nodiscard]] constexpr bool IsBlank(char c) {
    return Ascii::IsWhiteSpace(c);
}

/// Letters of ASCII in lower case.
[[nodiscard]] inline std::string Lower(std::string_view text) {
    std::string lower(text);
    std::transform(lower.begin(), lower.end(), lower.begin(), Ascii::ToLower);
    return lower;
}

/// The first word; `text` goes on behind it and the blanks that follow.
constexpr std::string_view TakeWordOf(std::string_view& text) {
    text = TrimmedInFront(text);
    const std::string_view word = text.substr(0, text.find_first_of(Ascii::kWhiteSpace));
    text = TrimmedInFront(text.substr(word.size()));
    return word;
}

/// The first line without its end; `text` goes on behind it.
constexpr std::string_view TakeLine(std::string_view& text) {
    const std::string_view line = text.substr(0, text.find('\n'));
    text.remove_prefix(std::min(line.size() + 1, text.size()));
    return line;
}

}  // namespace brindle::SongText
