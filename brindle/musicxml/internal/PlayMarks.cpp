// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/PlayMarks.h"

namespace brindle {

void CPlayMarks::Add(const CPlayMarks& other) {
    mRepeatForward |= other.mRepeatForward;
    mRepeatBackward |= other.mRepeatBackward;
    mRepeatAfterJump |= other.mRepeatAfterJump;
    if (mRepeatTimes == 0) mRepeatTimes = other.mRepeatTimes;
    mEndingStarts |= other.mEndingStarts;
    mEndingStops |= other.mEndingStops;
    if (mEndingNumbers.empty()) mEndingNumbers = other.mEndingNumbers;
    mDaCapo |= other.mDaCapo;
    mDalSegno.Add(other.mDalSegno);
    mAlFine |= other.mAlFine;
    mAlCoda |= other.mAlCoda;
    mSegno.Add(other.mSegno);
    mCoda.Add(other.mCoda);
    mToCoda.Add(other.mToCoda);
    mFine |= other.mFine;
}

}  // namespace brindle
