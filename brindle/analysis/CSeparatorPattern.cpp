// SPDX-License-Identifier: MIT
#include "brindle/analysis/CSeparatorPattern.h"
#include "brindle/platform/Ascii.h"

#include <cstddef>
#include <utility>

namespace brindle {

namespace {

constexpr std::string_view kWhiteSpacePattern = "\\s+";

// The matcher of the standard library may recurse once per character, and its time may grow with
// the square of the text. It therefore sees one window at a time, and a match counts when it begins
// in the first half, so that it could have been as long as the other half.
constexpr std::ptrdiff_t kHalfWindow = 128;

struct CSeparator {
    const char* mBegin;
    const char* mEnd;
    [[nodiscard]] bool IsEmpty() const { return mBegin == mEnd; }
};

using TFlags = std::regex_constants::match_flag_type;

/// Searches regular expression matches in one text.
class CWindowedSearch {
public:
    CWindowedSearch(std::string_view text, const std::regex& regex)
        : mBegin(text.data()), mEnd(text.data() + text.size()), mRegex(regex) {}

    [[nodiscard]] std::optional<CSeparator> FirstFrom(const char* from) const {
        std::cmatch match;
        while (true) {
            const bool isLast = mEnd - from <= 2 * kHalfWindow;
            const char* const stop = isLast ? mEnd : from + 2 * kHalfWindow;
            const bool found = std::regex_search(from, stop, match, mRegex, Flags(from, stop));
            if (found && (isLast || match[0].first - from < kHalfWindow)) {
                return CSeparator{match[0].first, match[0].second};
            }
            if (isLast) return std::nullopt;
            from += kHalfWindow;
        }
    }

    /// After an empty match: a match that begins here and is not empty, or one further on.
    [[nodiscard]] std::optional<CSeparator> NextFrom(const char* from) const {
        if (from == mEnd) return std::nullopt;
        const char* const stop = mEnd - from <= kHalfWindow ? mEnd : from + kHalfWindow;
        const TFlags flags = Flags(from, stop) | std::regex_constants::match_not_null |
                             std::regex_constants::match_continuous;
        std::cmatch match;
        if (std::regex_search(from, stop, match, mRegex, flags)) {
            return CSeparator{match[0].first, match[0].second};
        }
        return FirstFrom(from + 1);
    }

private:
    [[nodiscard]] TFlags Flags(const char* from, const char* stop) const {
        TFlags flags = std::regex_constants::match_default;
        if (from != mBegin) flags |= std::regex_constants::match_prev_avail;
        if (stop != mEnd) flags |= std::regex_constants::match_not_eol;
        return flags;
    }

    const char* mBegin;
    const char* mEnd;
    const std::regex& mRegex;
};

std::vector<std::string> SplitAtWhiteSpace(std::string_view text) {
    std::vector<std::string> pieces;
    std::size_t begin = 0;
    while (true) {
        const std::size_t end = text.find_first_of(Ascii::kWhiteSpace, begin);
        if (end == text.npos) break;
        pieces.emplace_back(text.substr(begin, end - begin));
        begin = text.find_first_not_of(Ascii::kWhiteSpace, end);
        if (begin == text.npos) return pieces;
    }
    pieces.emplace_back(text.substr(begin));
    return pieces;
}

std::vector<std::string> SplitAtMatches(std::string_view text, const std::regex& regex) {
    const CWindowedSearch search(text, regex);
    std::vector<std::string> pieces;
    const char* begin = text.data();
    const char* const end = text.data() + text.size();
    try {
        auto separator = search.FirstFrom(begin);
        while (separator) {
            pieces.emplace_back(begin, separator->mBegin);
            begin = separator->mEnd;
            separator = separator->IsEmpty() ? search.NextFrom(begin) : search.FirstFrom(begin);
        }
    } catch (const std::regex_error&) {
        // The matcher gave up on a hard pattern: what is left is one piece.
    }
    if (begin != end || pieces.empty()) pieces.emplace_back(begin, end);
    return pieces;
}

}  // namespace

CSeparatorPattern::CSeparatorPattern(const std::string& pattern)
    : mIsWhiteSpace(pattern == kWhiteSpacePattern) {
    if (mIsWhiteSpace) return;
    try {
        mRegex.emplace(pattern);
    } catch (const std::regex_error&) {
        mRegex.reset();
    }
}

CSeparatorPattern::CSeparatorPattern(const char* pattern) : mIsWhiteSpace(false) {
    if (pattern != nullptr) *this = CSeparatorPattern(std::string(pattern));
}

CSeparatorPattern::CSeparatorPattern(std::regex regex)
    : mIsWhiteSpace(false), mRegex(std::move(regex)) {}

std::vector<std::string> CSeparatorPattern::Split(std::string_view text) const {
    if (mIsWhiteSpace) return SplitAtWhiteSpace(text);
    if (mRegex) return SplitAtMatches(text, *mRegex);
    return {std::string(text)};
}

}  // namespace brindle
