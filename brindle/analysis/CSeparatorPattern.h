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
/// The default, the pattern text `\s+`, is split by hand in one pass and knows the six white space
/// characters of ASCII whatever the locale; a UTF-8 no-break space separates nothing. Any other
/// pattern is searched through small windows of the text, so that time and stack stay bounded on
/// long texts: a separator may be up to 128 bytes long, a longer one counts as several.
class CSeparatorPattern {
public:
    CSeparatorPattern() = default;
    /// A text that is no regular expression, a null pointer too, separates nothing.
    CSeparatorPattern(const std::string& pattern);
    /// The same.
    CSeparatorPattern(const char* pattern);
    /// The matches of a compiled expression, in its own grammar.
    CSeparatorPattern(std::regex regex);

    /// The pieces between the separators. A separator at the very start gives an empty first
    /// piece, one at the very end gives none; a text without a separator is one piece.
    [[nodiscard]] std::vector<std::string> Split(std::string_view text) const;

private:
    bool mIsWhiteSpace = true;
    /// Empty for white space, and for a pattern that is no regular expression.
    std::optional<std::regex> mRegex;
};

}  // namespace brindle
