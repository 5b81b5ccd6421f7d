// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace brindle {

/// A numeral with the many signs that people write folded into those of the tables, and what stands
/// in square brackets apart from it.
class CFoldedNumeral {
public:
    /// No numeral is longer; what is longer is not looked at.
    static constexpr std::size_t kLongest = 128;
    static constexpr std::size_t kMostGroups = 16;

    /// `typed` is at most kLongest bytes.
    explicit CFoldedNumeral(std::string_view typed);

    /// Without the brackets.
    [[nodiscard]] std::string_view Text() const { return {mChars.data(), mSize}; }
    [[nodiscard]] std::size_t GroupCount() const { return mGroupCount; }
    /// What stands in one of the brackets.
    [[nodiscard]] std::string_view Group(std::size_t ix) const;
    /// Where in the typed text a piece of Text() or of a group begins, in bytes.
    [[nodiscard]] std::size_t OffsetOf(std::string_view piece) const;
    /// The brackets match and are not too many.
    [[nodiscard]] bool IsWhole() const { return mIsWhole; }
    /// Where the bracket is that has no other, or is one too many; 0 if they match.
    [[nodiscard]] std::size_t OffsetOfWrongBracket() const { return mWrongBracket; }

private:
    struct CGroup {
        std::size_t mBegin = 0;
        std::size_t mEnd = 0;
    };

    void Fold(std::string_view typed);
    void CutGroups();

    // The numeral from the left, the groups behind it.
    std::array<char, kLongest + 1> mChars;
    std::array<std::uint8_t, kLongest + 1> mOffsets;
    std::size_t mSize = 0;
    std::size_t mFoldedSize = 0;
    std::array<CGroup, kMostGroups> mGroups{};
    std::size_t mGroupCount = 0;
    bool mIsWhole = true;
    std::size_t mWrongBracket = 0;
};

}  // namespace brindle
