// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/Utf8.h"

#include <cstddef>
#include <string_view>

namespace brindle {

/// Bytes of a text against its lines and columns (in characters), both from 1. A place is counted
/// on from the one before it, so that all faults of a text together cost one way through it.
class CTextPlaces {
public:
    explicit CTextPlaces(std::string_view text) : mText(text) {}

    /// Offsets must ascend. Behind the end of the text is its end.
    void GoToByte(std::size_t offset) {
        while (mOffset < offset && mOffset < mText.size()) Step();
    }
    /// A column behind the end of its line is that end; going back begins anew.
    void GoToColumn(std::size_t line, std::size_t column) {
        if (line < mLine || (line == mLine && column < mColumn)) *this = CTextPlaces(mText);
        while (mOffset < mText.size() && (mLine < line || (mLine == line && mColumn < column))) {
            if (mText[mOffset] == '\n' && mLine == line) return;
            Step();
        }
    }

    [[nodiscard]] std::size_t Offset() const { return mOffset; }
    [[nodiscard]] std::size_t Line() const { return mLine; }
    [[nodiscard]] std::size_t Column() const { return mColumn; }

private:
    /// One character with all of its bytes.
    void Step() {
        const bool isBreak = mText[mOffset++] == '\n';
        while (mOffset < mText.size() && !BeginsUtf8Character(mText[mOffset])) ++mOffset;
        mLine += isBreak ? 1 : 0;
        mColumn = isBreak ? 1 : mColumn + 1;
    }

    std::string_view mText;
    std::size_t mOffset = 0;
    std::size_t mLine = 1;
    std::size_t mColumn = 1;
};

}  // namespace brindle
