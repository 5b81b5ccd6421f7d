// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/PlayingOrder.h"

#include "brindle/musicxml/PlayedMeasures.h"
#include "brindle/musicxml/internal/JumpPlan.h"

#include <algorithm>

namespace brindle {

namespace {

class CPlayer {
public:
    explicit CPlayer(const TScoreMeasures& measures)
        : mWritten(measures),
          mPlan(MakeJumpPlan(measures)),
          mMostPlayed(PlayLimitsOf(measures.size(), 0).mMeasures),
          mLastPlayed(measures.size(), kNoMeasure),
          mHasJumped(measures.size(), false) {}

    [[nodiscard]] TPlayingOrder Play() {
        std::size_t ix = 0;
        while (ix < mWritten.size()) {
            if (const std::size_t other = ChooseEnding(ix); other != ix) {
                ix = other;
                continue;
            }
            if (mOrder.mMeasures.size() == mMostPlayed) {
                mOrder.mWasCut = true;
                break;
            }
            mLastPlayed[ix] = mOrder.mMeasures.size();
            mOrder.mMeasures.push_back(static_cast<std::uint32_t>(ix));
            ix = Next(ix);
        }
        return std::move(mOrder);
    }

private:
    // At the first of some endings: the first measure of the one to play, or what is behind them.
    [[nodiscard]] std::size_t ChooseEnding(std::size_t ix) {
        const std::size_t at = mPlan.mMeasures[ix].mEnding;
        if (at == kNoMeasure || ix != mPlan.mEndings[at].mFirst || mIsEndingChosen) {
            mIsEndingChosen = false;
            return ix;
        }
        const TEndingGroup& group = mPlan.mGroups[mPlan.mEndings[at].mGroup];
        if (group.mFirstEnding != at) return ix;
        const std::size_t chosen = EndingOf(group, PassOf(group.mRepeatStart));
        if (chosen == kNoMeasure) return group.mBehind;
        mIsEndingChosen = chosen != at;
        return mPlan.mEndings[chosen].mFirst;
    }

    [[nodiscard]] std::size_t EndingOf(const TEndingGroup& group, std::int32_t pass) const {
        const std::size_t first = group.mFirstEnding;
        const std::size_t last = first + group.mEndingCount - 1;
        const std::size_t lastOrNone =
            group.mEndingCount == 1 && mPlan.mEndings[last].mGoesBack ? kNoMeasure : last;
        if (mIsAfterJump && !group.mIsForAfterJump) {
            if (mToFine && group.mEndingWithFine != kNoMeasure) return group.mEndingWithFine;
            if (mToCoda && group.mEndingWithToCoda != kNoMeasure) return group.mEndingWithToCoda;
            return lastOrNone;
        }
        const auto& endings = group.mEndingOfPass;
        if (const auto it = endings.find(pass); it != endings.end()) return it->second;
        return pass < endings.begin()->first ? first : lastOrNone;
    }

    [[nodiscard]] std::size_t Next(std::size_t ix) {
        const TMeasurePlan& plan = mPlan.mMeasures[ix];
        const TPlayMarks& marks = mWritten[ix].mMarks;
        if (mToFine && marks.mFine) return mWritten.size();
        if (plan.mRepeatStart != kNoMeasure) {
            if (GoesBackAt(ix, ix)) return GoBack(ix);
            LeaveRepeat();
        }
        if (mToCoda && plan.mCodaTarget != kNoMeasure) return GoToCoda(plan.mCodaTarget);
        if (plan.mJumpTarget != kNoMeasure && !mHasJumped[ix]) {
            const bool isLastPass = plan.mRepeatEnd == kNoMeasure || plan.mRepeatEnd == ix ||
                                    !GoesBackAt(plan.mRepeatEnd, ix);
            if (isLastPass) return Jump(ix);
        }
        if (mIsAfterJump && ix >= mJumpedFrom) mIsAfterJump = false;
        if (plan.mEnding != kNoMeasure && ix == mPlan.mEndings[plan.mEnding].mLast) {
            LeaveRepeat();
            return mPlan.mGroups[mPlan.mEndings[plan.mEnding].mGroup].mBehind;
        }
        return ix + 1;
    }

    // Whether this pass goes back at `end`, seen from the measure `ix` in front of it.
    [[nodiscard]] bool GoesBackAt(std::size_t end, std::size_t ix) const {
        const TMeasurePlan& plan = mPlan.mMeasures[end];
        if (mIsAfterJump && !mWritten[end].mMarks.mRepeatAfterJump) return false;
        const std::int32_t pass = PassOf(plan.mRepeatStart);
        if (plan.mEnding == kNoMeasure) return pass < plan.mRepeatTimes;
        std::size_t ending = plan.mEnding;
        const TEndingGroup& group = mPlan.mGroups[mPlan.mEndings[ending].mGroup];
        if (mPlan.mMeasures[ix].mEnding == kNoMeasure) ending = EndingOf(group, pass);
        if (ending == kNoMeasure || !mPlan.mEndings[ending].mGoesBack) return false;
        const bool isLast = ending + 1 == group.mFirstEnding + group.mEndingCount;
        return !isLast || group.mEndingCount == 1 || pass < plan.mRepeatTimes;
    }

    [[nodiscard]] std::size_t GoBack(std::size_t ix) {
        const std::size_t start = mPlan.mMeasures[ix].mRepeatStart;
        mPass = PassOf(start) + 1;
        mRepeatStart = start;
        AppendJumpBack(start);
        return start;
    }

    [[nodiscard]] std::size_t GoToCoda(std::size_t coda) {
        mToCoda = mToFine = mIsAfterJump = false;
        LeaveRepeat();
        mIsEndingChosen = mPlan.mMeasures[coda].mEnding != kNoMeasure;
        return coda;
    }

    // A jump that tells neither "al Fine" nor "al Coda" obeys both where it finds them.
    [[nodiscard]] std::size_t Jump(std::size_t ix) {
        const TPlayMarks& marks = mWritten[ix].mMarks;
        mHasJumped[ix] = true;
        mIsAfterJump = true;
        mJumpedFrom = EndOfRepeatAround(ix);
        mToFine = marks.mAlFine || !marks.mAlCoda;
        mToCoda = marks.mAlCoda || !marks.mAlFine;
        LeaveRepeat();
        const std::size_t target = mPlan.mMeasures[ix].mJumpTarget;
        AppendJumpBack(target);
        return target;
    }

    // The last measure of the repeat around this one, with all of its endings.
    [[nodiscard]] std::size_t EndOfRepeatAround(std::size_t ix) const {
        const std::size_t repeatEnd = mPlan.mMeasures[ix].mRepeatEnd;
        const std::size_t end = repeatEnd == kNoMeasure ? ix : repeatEnd;
        const std::size_t ending = mPlan.mMeasures[end].mEnding;
        if (ending == kNoMeasure) return end;
        return mPlan.mGroups[mPlan.mEndings[ending].mGroup].mBehind - 1;
    }

    void AppendJumpBack(std::size_t target) {
        if (mLastPlayed[target] == kNoMeasure) return;
        mOrder.mJumpsBack.push_back({mOrder.mMeasures.size(), mLastPlayed[target]});
    }

    [[nodiscard]] std::int32_t PassOf(std::size_t repeatStart) const {
        return mRepeatStart == repeatStart ? mPass : 1;
    }
    void LeaveRepeat() { mRepeatStart = kNoMeasure; }

    const TScoreMeasures& mWritten;
    TJumpPlan mPlan;
    std::size_t mMostPlayed;
    TPlayingOrder mOrder;
    std::vector<std::size_t> mLastPlayed;  // of each measure, an index into the order
    std::vector<bool> mHasJumped;

    std::size_t mRepeatStart = kNoMeasure;  // of the repeat that is being played
    std::int32_t mPass = 1;
    bool mIsEndingChosen = false;

    bool mIsAfterJump = false;
    std::size_t mJumpedFrom = 0;
    bool mToFine = false;
    bool mToCoda = false;
};

}  // namespace

TPlayingOrder PlayScore(const TScoreMeasures& measures) {
    return CPlayer(measures).Play();
}

}  // namespace brindle
