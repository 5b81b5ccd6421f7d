// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/Ascii.h"

#include <cassert>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace brindle {

/// The keyword matcher under every reader of typed names: chord symbols, scales, sign keys.
///
/// A keyword list is any sequence of texts. Its order matters, since the first match wins, and it
/// keeps three rules: no keyword is empty, all are lower case, and a longer keyword stands before
/// a shorter one that it begins with (where a keyword must be the whole remainder, the last rule
/// does not matter). Positions count bytes. Lower case is that of ASCII alone: other bytes never
/// change, whatever the locale.
namespace SetFromStringHelper {

/// How much of the remaining text a keyword must account for.
enum TSpaces : std::int32_t {
    /// The keyword is a prefix of the remaining text.
    TSpaces_AnyRemainder = 0,
    /// The keyword is also the whole remaining text: blanks apart, both have the same length.
    TSpaces_WholeRemainder = 1,
};

using Ascii::ToLower;

/// A lower-case copy of `text`, byte by byte.
[[nodiscard]] std::string ToLowercase(std::string_view text);

/// What is left of `text` from `pos` on; nothing when `pos` lies outside.
[[nodiscard]] constexpr std::string_view RemainderFrom(std::string_view text, int pos) {
    if (pos < 0 || static_cast<std::size_t>(pos) >= text.size()) return {};
    return text.substr(static_cast<std::size_t>(pos));
}

/// Advances `pos` while the character there is a blank.
void SkipLeadingBlanks(std::string_view text, int& pos);

/// True when `pos` is negative, or when `keyword` and the text from `pos` on, both without their
/// blanks, differ in length.
[[nodiscard]] bool _RemainingLengthWithoutSpacesDiffers(std::string_view keyword,
                                                        std::string_view text, int pos);

/// Whether the keywords keep the three rules of a list.
template <class CKeywords>
[[nodiscard]] constexpr bool AreNotEmptyAndSortedBySizeAndLowerCase(const CKeywords& keywords) {
    for (auto later = keywords.begin(); later != keywords.end(); ++later) {
        const std::string_view keyword = *later;
        if (keyword.empty()) return false;
        for (const char c : keyword) {
            if (c != ToLower(c)) return false;
        }
        for (auto earlier = keywords.begin(); earlier != later; ++earlier) {
            if (keyword.starts_with(*earlier)) return false;
        }
    }
    return true;
}

/// Stops a debug build when the keywords break a rule; does nothing in a release build.
template <class CKeywords>
constexpr void _AssertStringsAreNotEmptyAndSortedBySizeAndLowerCase(
    [[maybe_unused]] const CKeywords& keywords) {
    assert(AreNotEmptyAndSortedBySizeAndLowerCase(keywords));
}

/// The first keyword that matches the lower-case `text` at `pos`: whether there is one, and its
/// length. Blanks within a keyword are matched literally. A position outside the text matches
/// nothing.
template <class CKeywords>
[[nodiscard]] std::pair<bool, int> CompareLowercaseStrs(TSpaces spaces, const CKeywords& keywords,
                                                        std::string_view text, int pos) {
    const std::string_view remainder = RemainderFrom(text, pos);
    for (const std::string_view keyword : keywords) {
        if (!remainder.starts_with(keyword)) continue;
        if (spaces == TSpaces_WholeRemainder &&
            _RemainingLengthWithoutSpacesDiffers(keyword, text, pos)) {
            continue;
        }
        return {true, static_cast<int>(keyword.size())};
    }
    return {false, 0};
}

/// The same; on a match moves `pos` behind the keyword.
template <class CKeywords>
bool CompareLowercaseStrsAndOnMatchAdvanceStringPos(TSpaces spaces, const CKeywords& keywords,
                                                    std::string_view text, int& pos) {
    const auto [matches, length] = CompareLowercaseStrs(spaces, keywords, text, pos);
    pos += length;
    return matches;
}

/// Whether a keyword matches a lower-case copy of `text` from its start.
template <class CKeywords>
[[nodiscard]] bool CompareStrs(TSpaces spaces, const CKeywords& keywords, std::string_view text) {
    return CompareLowercaseStrs(spaces, keywords, ToLowercase(text), 0).first;
}

}  // namespace SetFromStringHelper

/// A thing of a vocabulary: the keywords that mean it, its name, and a value that belongs to the
/// owner of the table, such as a scale's mask or a sign key type.
struct CKeywordsAndName {
    std::vector<std::string> mKeywords;  ///< in the order in which they are tried
    std::string mName;                   ///< as it is shown
    std::int32_t mPayload = 0;           ///< 0 if the table needs none

    /// Whether a keyword matches `text` from its start, in any letter case.
    [[nodiscard]] bool MatchesKeywords(SetFromStringHelper::TSpaces spaces,
                                       std::string_view text) const;
};

/// A vocabulary, in the order in which its things are tried.
class CKeywordsAndNames : public std::vector<CKeywordsAndName> {
public:
    using std::vector<CKeywordsAndName>::vector;

    /// The first record whose keywords match, or the end.
    [[nodiscard]] const_iterator FindFirstMatching(SetFromStringHelper::TSpaces spaces,
                                                   std::string_view text) const;
    /// The same, to change it.
    [[nodiscard]] iterator FindFirstMatching(SetFromStringHelper::TSpaces spaces,
                                             std::string_view text);

    /// Skips blanks from `pos`, then finds the first record with a keyword that is all of `text`
    /// from there on, in any letter case and blanks apart. On a match moves `pos` behind it.
    const_iterator FindWholeRemainderAndAdvance(std::string_view text, int& pos) const;
};

}  // namespace brindle
