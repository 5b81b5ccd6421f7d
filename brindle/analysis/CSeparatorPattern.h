// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <regex>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// What stands between the tokens of a text: a regular expression in ECMAScript grammar.
///
/// The default, white space `\s+`, is split by hand in one pass and knows the six white space
/// characters of ASCII whatever the locale; a UTF-8 no-break space separates nothing.
class CSeparatorPattern {
public:
    CSeparatorPattern() = default;
    /// A pattern that is no regular expression separates nothing.
    CSeparatorPattern(const std::string& pattern);
    CSeparatorPattern(const char* pattern);
    CSeparatorPattern(std::regex regex);

    /// The pieces between the separators. A separator at the very start gives an empty first
    /// piece, one at the very end gives none; a text without a separator is one piece.
    [[nodiscard]] std::vector<std::string> Split(std::string_view text) const;

private:
    /// Empty for white space.
    std::optional<std::regex> mRegex;
};

}  // namespace brindle
