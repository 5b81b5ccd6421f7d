// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace brindle {

/// A part of a song.
struct CFormPart {
    char mLetter = 'A';
    std::size_t mFirstBar = 0;
    std::size_t mBars = 0;
    /// It comes to rest: the last part, and the second of two of one letter before another one.
    bool mIsClosed = false;
    /// It does not: the first of two parts of one letter, and those that are like it.
    bool mStaysOpen = false;
    /// The parts before it that begin as it does, and that end as it does, too; -1 for none. It is
    /// written anew, or its last bars are, where there is none.
    std::ptrdiff_t mBeginsLike = -1;
    std::ptrdiff_t mIsLike = -1;

    [[nodiscard]] bool IsNew() const { return mBeginsLike < 0; }
    /// Where its own ending begins, in bars from its begin.
    [[nodiscard]] std::size_t EndingBar() const;
};

/// The parts of a form such as "AABA"; a single part without one. Nothing if the bars cannot be
/// shared, or if a letter is none from A to Z.
[[nodiscard]] std::vector<CFormPart> PartsOfForm(const std::string& form, std::size_t bars);

}  // namespace brindle
