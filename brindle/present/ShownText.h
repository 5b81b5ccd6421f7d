// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

// Text as people see it: what is safe to show, and how wide it is. All of it is UTF-8.

/// The text without what would disturb a terminal or an XML file: unprintable characters (see
/// IsUnprintable) and bytes that are no UTF-8 become U+FFFD.
[[nodiscard]] std::string Printable(std::string_view text);

/// The number of characters of a text, which is its width in a fixed font.
[[nodiscard]] std::size_t CountCharacters(std::string_view text);

/// The first `count` characters of a text.
[[nodiscard]] std::string FirstCharacters(std::string_view text, std::size_t count);

/// The text with blanks behind it up to so many characters.
[[nodiscard]] std::string PadRight(std::string_view text, std::size_t width);
/// The text with blanks in front of it.
[[nodiscard]] std::string PadLeft(std::string_view text, std::size_t width);

/// A number with at most three digits after the point and no zeros at the end: "1", "2.5".
[[nodiscard]] std::string ShortNumber(double number);

/// The words with blanks between; of more than eight only the first and the last four.
[[nodiscard]] std::string FirstAndLast(const std::vector<std::string>& words);

/// The words in lines of at most `width` characters, with blanks between. A longer word has a line
/// for itself.
[[nodiscard]] std::vector<std::string> InLines(const std::vector<std::string>& words,
                                               std::size_t width);

}  // namespace brindle
