// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/JumpPlan.h"
#include "brindle/musicxml/internal/ScoreWords.h"

#include <algorithm>
#include <optional>
#include <utility>

namespace brindle {

namespace {

class CEndings {
public:
    CEndings(TMarksOfMeasures marks, CJumpPlan& plan) : mMarks(marks), mPlan(plan) {}

    void Plan() {
        Find();
        ReachForRepeatSigns();
        TellEqualNumbersApart();
        for (std::size_t i = 0; i < mPlan.mEndings.size(); ++i) AddToGroup(i);
        LetAllButTheLastGoBack();
    }

private:
    // An ending goes on to its end, to the sign that goes back, or else to the next ending or
    // repeat.
    void Find() {
        for (std::size_t ix = 0; ix < mMarks.size(); ++ix) {
            const CPlayMarks& marks = mMarks[ix];
            if (ix > 0 && (marks.mEndingStarts || marks.mRepeatForward)) Close(ix - 1);
            if (marks.mEndingStarts) {
                mOpen.emplace();
                mOpen->mFirst = ix;
                mOpen->mNumbers = marks.mEndingNumbers;
            }
            if (marks.mEndingStops || marks.mRepeatBackward) Close(ix);
        }
        if (!mMarks.empty()) Close(mMarks.size() - 1);
    }

    void Close(std::size_t last) {
        if (!mOpen) return;
        mOpen->mLast = last;
        mPlan.mEndings.push_back(std::move(*mOpen));
        mOpen.reset();
    }

    // A bracket may be drawn over its first bar only; the ending lasts up to the sign that goes
    // back in front of the next ending all the same.
    void ReachForRepeatSigns() {
        for (std::size_t i = 0; i + 1 < mPlan.mEndings.size(); ++i) {
            CEnding& ending = mPlan.mEndings[i];
            const CEnding& next = mPlan.mEndings[i + 1];
            const bool goesOn = Continues(ending, next) || HaveOneNumber(ending, next);
            if (!goesOn || mMarks[ending.mLast].mRepeatBackward) continue;
            std::size_t ix = ending.mLast + 1;
            while (ix < next.mFirst && !mMarks[ix].mRepeatBackward && !mMarks[ix].mRepeatForward) {
                ++ix;
            }
            if (ix + 1 == next.mFirst && mMarks[ix].mRepeatBackward) ending.mLast = ix;
        }
    }

    // Of two endings side by side with the same number one is meant for the pass before, or else
    // the other for the pass behind: "2." and "2." are the first and the second.
    void TellEqualNumbersApart() {
        std::int32_t before = 0;
        for (std::size_t i = 0; i + 1 < mPlan.mEndings.size(); ++i) {
            CEnding& ending = mPlan.mEndings[i];
            CEnding& next = mPlan.mEndings[i + 1];
            if (!AreSideBySide(ending, next)) {
                before = 0;
                continue;
            }
            if (HaveOneNumber(ending, next)) {
                if (ending.mNumbers.front() - 1 > before) {
                    --ending.mNumbers.front();
                } else {
                    ++next.mNumbers.front();
                }
            }
            if (!ending.mNumbers.empty()) before = ending.mNumbers.back();
        }
    }

    [[nodiscard]] bool AreSideBySide(const CEnding& ending, const CEnding& next) const {
        return ending.mLast + 1 == next.mFirst && !mMarks[next.mFirst].mRepeatForward;
    }
    static bool HaveOneNumber(const CEnding& ending, const CEnding& next) {
        return ending.mNumbers.size() == 1 && ending.mNumbers == next.mNumbers;
    }
    // Whether the numbers of an ending go on where those of the one before end.
    static bool Continues(const CEnding& ending, const CEnding& next) {
        if (ending.mNumbers.empty() || next.mNumbers.empty()) return true;
        return next.mNumbers.front() > ending.mNumbers.back();
    }

    void AddToGroup(std::size_t i) {
        CEnding& ending = mPlan.mEndings[i];
        if (!BelongsToLastGroup(i)) mPlan.mGroups.emplace_back().mFirstEnding = i;
        ending.mGroup = mPlan.mGroups.size() - 1;
        CEndingGroup& group = mPlan.mGroups.back();
        Describe(i, group);
        if (ending.mNumbers.empty()) ending.mNumbers = {group.HighestNumber() + 1};
        ++group.mEndingCount;
        group.mBehind = ending.mLast + 1;
        for (const std::int32_t pass : ending.mNumbers) group.mEndingOfPass.emplace(pass, i);
        group.mIsForAfterJump |= mMarks[ending.mLast].mRepeatAfterJump;
    }

    [[nodiscard]] bool BelongsToLastGroup(std::size_t i) const {
        if (i == 0) return false;
        const CEnding& before = mPlan.mEndings[i - 1];
        const CEnding& ending = mPlan.mEndings[i];
        return AreSideBySide(before, ending) && Continues(before, ending) &&
               mPlan.mGroups.back().HighestNumber() < kHighestEndingNumber;
    }

    void Describe(std::size_t i, CEndingGroup& group) {
        CEnding& ending = mPlan.mEndings[i];
        ending.mGoesBack = mMarks[ending.mLast].mRepeatBackward;
        for (std::size_t ix = ending.mFirst; ix <= ending.mLast; ++ix) {
            mPlan.mMeasures[ix].mEnding = i;
            if (mMarks[ix].mFine) group.mEndingWithFine = std::min(group.mEndingWithFine, i);
        }
    }

    // Even where the sign was forgotten.
    void LetAllButTheLastGoBack() {
        for (std::size_t i = 0; i + 1 < mPlan.mEndings.size(); ++i) {
            CEnding& ending = mPlan.mEndings[i];
            if (mPlan.mEndings[i + 1].mGroup != ending.mGroup) continue;
            if (!mMarks[ending.mLast].Jumps()) ending.mGoesBack = true;
        }
    }

    TMarksOfMeasures mMarks;
    CJumpPlan& mPlan;
    std::optional<CEnding> mOpen;
};

}  // namespace

void PlanEndings(TMarksOfMeasures marks, CJumpPlan& plan) {
    CEndings(marks, plan).Plan();
}

}  // namespace brindle
