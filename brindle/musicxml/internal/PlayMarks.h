// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// A place that jumps lead to, with the name that the song gives it, if any.
struct CJumpMark {
    bool mIsSet = false;
    std::string mName;

    void Set(std::string_view name = {}) {
        mIsSet = true;
        if (mName.empty()) mName = name;
    }
    void Add(const CJumpMark& other) {
        if (other.mIsSet) Set(other.mName);
    }
};

/// What steers the playing of a bar, gathered from signs, words and sound instructions alike, in a
/// score or in a text.
struct CPlayMarks {
    bool mRepeatForward = false;
    bool mRepeatBackward = false;
    /// Whether the repeat is taken again after a jump back.
    bool mRepeatAfterJump = false;
    /// How often the repeat that ends (or else begins) here is played; 0 where nothing tells it.
    std::int32_t mRepeatTimes = 0;

    bool mEndingStarts = false;
    bool mEndingStops = false;
    /// The passes in which the ending is played, as written.
    std::vector<std::int32_t> mEndingNumbers;

    bool mDaCapo = false;
    CJumpMark mDalSegno;
    bool mAlFine = false;
    bool mAlCoda = false;
    CJumpMark mSegno;
    CJumpMark mCoda;
    CJumpMark mToCoda;
    bool mFine = false;

    [[nodiscard]] bool Jumps() const { return mDaCapo || mDalSegno.mIsSet; }
    /// Joins what another part of the score tells about the same bar.
    void Add(const CPlayMarks& other);
};

}  // namespace brindle
