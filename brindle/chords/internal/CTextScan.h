// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/Ascii.h"

#include <cstddef>
#include <string_view>

namespace brindle::ChordText {

using Ascii::IsDigit;
using Ascii::IsLetter;
/// A to H, as a chord in capitals begins.
[[nodiscard]] constexpr bool IsCapitalNote(char c) {
    return c >= 'A' && c <= 'H';
}

/// A place in a folded chord text.
class CTextScan {
public:
    std::size_t mPos = 0;

    constexpr CTextScan(std::string_view text, std::string_view lower)
        : mText(text), mLower(lower) {}

    [[nodiscard]] constexpr bool AtEnd() const { return mPos >= mText.size(); }
    [[nodiscard]] constexpr std::size_t End() const { return mText.size(); }
    [[nodiscard]] constexpr std::string_view Rest() const { return mText.substr(mPos); }
    /// The character `ahead` of the place; 0 beyond the end.
    [[nodiscard]] constexpr char Peek(std::size_t ahead = 0) const {
        return ahead < mText.size() - mPos ? mText[mPos + ahead] : '\0';
    }
    /// The character before the place; 0 at the start.
    [[nodiscard]] constexpr char Last() const { return mPos > 0 ? mText[mPos - 1] : '\0'; }
    /// The same without the blanks in between.
    [[nodiscard]] constexpr char LastNonBlank() const {
        std::size_t pos = mPos;
        while (pos > 0 && mText[pos - 1] == ' ') --pos;
        return pos > 0 ? mText[pos - 1] : '\0';
    }

    [[nodiscard]] constexpr bool Sees(std::string_view exact) const {
        return mText.substr(mPos).starts_with(exact);
    }
    /// The same in any case; `word` is lower case.
    [[nodiscard]] constexpr bool SeesWord(std::string_view word) const {
        return mLower.substr(mPos).starts_with(word);
    }
    constexpr bool Take(char c) {
        if (Peek() != c || AtEnd()) return false;
        ++mPos;
        return true;
    }
    constexpr bool TakeWord(std::string_view word) {
        if (!SeesWord(word)) return false;
        mPos += word.size();
        return true;
    }
    constexpr void SkipBlanks() {
        while (Peek() == ' ') ++mPos;
    }
    /// Nothing behind `end` is there any more.
    constexpr void CutAt(std::size_t end) {
        mText = mText.substr(0, end);
        mLower = mLower.substr(0, end);
    }

private:
    std::string_view mText;
    std::string_view mLower;
};

}  // namespace brindle::ChordText
