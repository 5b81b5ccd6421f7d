// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/PlayingOrder.h"

#include "brindle/musicxml/PlayedMeasures.h"

#include <algorithm>

namespace brindle {

namespace {

/// The repeat that is being played.
class CPasses {
public:
    /// From 1, for the repeat that begins at `start`.
    [[nodiscard]] std::int32_t PassOf(std::size_t start) const {
        return mStart == start ? mPass : 1;
    }
    void GoBackTo(std::size_t start) {
        mPass = PassOf(start) + 1;
        mStart = start;
    }
    void Leave() { mStart = kNoMeasure; }

private:
    std::size_t mStart = kNoMeasure;
    std::int32_t mPass = 1;
};

/// What the last jump asks for.
class CLastJump {
public:
    /// A jump that tells neither "al Fine" nor "al Coda" obeys both where it finds them. What
    /// stands up to `end` was played before.
    void Jump(const CPlayMarks& marks, std::size_t end) {
        mIsPlayingAgain = true;
        mEnd = end;
        mToFine = marks.mAlFine || !marks.mAlCoda;
        mToCoda = marks.mAlCoda || !marks.mAlFine;
    }
    void ReachCoda() { *this = {}; }
    void Pass(std::size_t ix) { mIsPlayingAgain = mIsPlayingAgain && ix < mEnd; }

    [[nodiscard]] bool IsPlayingAgain() const { return mIsPlayingAgain; }
    [[nodiscard]] bool StopsAtFine() const { return mToFine; }
    [[nodiscard]] bool GoesToCoda() const { return mToCoda; }

private:
    bool mIsPlayingAgain = false;
    bool mToFine = false;
    bool mToCoda = false;
    std::size_t mEnd = 0;
};

class CScorePlayer {
public:
    explicit CScorePlayer(TMarksOfMeasures marks)
        : mMarks(marks),
          mPlan(MakeJumpPlan(marks)),
          mMostPlayed(PlayLimitsOf({.mMeasures = marks.size()}).mMeasures),
          mLastPlayed(marks.size(), kNoMeasure),
          mHasJumped(marks.size(), false) {}

    [[nodiscard]] CPlayingOrder Play() {
        std::size_t ix = 0;
        while (ix < mMarks.size()) {
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
        for (CJumpBack& jump : mOrder.mJumpsBack) Measure(jump);
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
        const CEndingGroup& group = mPlan.GroupOf(mPlan.mEndings[at]);
        if (group.mFirstEnding != at) return ix;
        const std::size_t chosen = EndingOf(group, mPasses.PassOf(group.mRepeatStart));
        if (chosen == kNoMeasure) return group.mBehind;
        mIsEndingChosen = chosen != at;
        return mPlan.mEndings[chosen].mFirst;
    }

    [[nodiscard]] std::size_t EndingOf(const CEndingGroup& group, std::int32_t pass) const {
        const std::size_t first = group.mFirstEnding;
        const std::size_t last = first + group.mEndingCount - 1;
        const std::size_t lastOrNone =
            group.mEndingCount == 1 && mPlan.mEndings[last].mGoesBack ? kNoMeasure : last;
        if (mJump.IsPlayingAgain() && !group.mIsForAfterJump) {
            if (mJump.StopsAtFine() && group.mEndingWithFine != kNoMeasure) {
                return group.mEndingWithFine;
            }
            const bool leads = mJump.GoesToCoda() && group.mEndingWithToCoda != kNoMeasure;
            return leads ? group.mEndingWithToCoda : lastOrNone;
        }
        const auto& endings = group.mEndingOfPass;
        if (const auto it = endings.find(pass); it != endings.end()) return it->second;
        return pass < endings.begin()->first ? first : lastOrNone;
    }

    [[nodiscard]] std::size_t Next(std::size_t ix) {
        const CMeasurePlan& plan = mPlan.mMeasures[ix];
        if (mJump.StopsAtFine() && mMarks[ix].mFine) return mMarks.size();
        if (plan.mRepeatStart != kNoMeasure) {
            if (GoesBackAt(ix, ix)) return GoBack(plan.mRepeatStart);
            mPasses.Leave();
        }
        if (mJump.GoesToCoda() && plan.mCodaTarget != kNoMeasure) {
            return GoToCoda(plan.mCodaTarget);
        }
        if (JumpsAt(ix)) return Jump(ix);
        mJump.Pass(ix);
        return Behind(ix);
    }

    // The next measure, or the one behind all endings.
    [[nodiscard]] std::size_t Behind(std::size_t ix) {
        const CEnding* ending = mPlan.EndingAt(ix);
        if (ending == nullptr || ix != ending->mLast) return ix + 1;
        mPasses.Leave();
        return mPlan.GroupOf(*ending).mBehind;
    }

    // Whether this pass goes back at `end`, seen from the measure `ix` in front of it.
    [[nodiscard]] bool GoesBackAt(std::size_t end, std::size_t ix) const {
        const CMeasurePlan& plan = mPlan.mMeasures[end];
        if (mJump.IsPlayingAgain() && !mMarks[end].mRepeatAfterJump) return false;
        const std::int32_t pass = mPasses.PassOf(plan.mRepeatStart);
        if (plan.mEnding == kNoMeasure) return pass < plan.mRepeatTimes;
        std::size_t ending = plan.mEnding;
        const CEndingGroup& group = mPlan.GroupOf(mPlan.mEndings[ending]);
        if (mPlan.mMeasures[ix].mEnding == kNoMeasure) ending = EndingOf(group, pass);
        if (ending == kNoMeasure || !mPlan.mEndings[ending].mGoesBack) return false;
        const bool isLast = ending + 1 == group.mFirstEnding + group.mEndingCount;
        return !isLast || group.mEndingCount == 1 || pass < plan.mRepeatTimes;
    }

    [[nodiscard]] std::size_t GoBack(std::size_t start) {
        mPasses.GoBackTo(start);
        AppendJumpBack(start);
        return start;
    }

    [[nodiscard]] std::size_t GoToCoda(std::size_t coda) {
        mJump.ReachCoda();
        mPasses.Leave();
        mIsEndingChosen = mPlan.mMeasures[coda].mEnding != kNoMeasure;
        return coda;
    }

    [[nodiscard]] bool JumpsAt(std::size_t ix) const {
        const CMeasurePlan& plan = mPlan.mMeasures[ix];
        if (plan.mJumpTarget == kNoMeasure || mHasJumped[ix]) return false;
        const bool isInRepeat = plan.mRepeatEnd != kNoMeasure && plan.mRepeatEnd != ix;
        return !isInRepeat || !GoesBackAt(plan.mRepeatEnd, ix);
    }

    [[nodiscard]] std::size_t Jump(std::size_t ix) {
        mHasJumped[ix] = true;
        mJump.Jump(mMarks[ix], EndOfRepeatAround(ix));
        mPasses.Leave();
        const std::size_t target = mPlan.mMeasures[ix].mJumpTarget;
        AppendJumpBack(target);
        return target;
    }

    // The last measure of the repeat around this one, with all of its endings.
    [[nodiscard]] std::size_t EndOfRepeatAround(std::size_t ix) const {
        const std::size_t repeatEnd = mPlan.mMeasures[ix].mRepeatEnd;
        const std::size_t end = repeatEnd == kNoMeasure ? ix : repeatEnd;
        const CEnding* ending = mPlan.EndingAt(end);
        return ending == nullptr ? end : mPlan.GroupOf(*ending).mBehind - 1;
    }

    void AppendJumpBack(std::size_t target) {
        if (mLastPlayed[target] == kNoMeasure) return;
        mOrder.mJumpsBack.push_back({mOrder.mMeasures.size(), mLastPlayed[target]});
    }

    void Measure(CJumpBack& jump) const {
        const std::vector<std::uint32_t>& played = mOrder.mMeasures;
        while (jump.mTo + jump.mLength < played.size() && jump.mFrom + jump.mLength < jump.mTo &&
               played[jump.mFrom + jump.mLength] == played[jump.mTo + jump.mLength]) {
            ++jump.mLength;
        }
    }

    TMarksOfMeasures mMarks;
    CJumpPlan mPlan;
    std::size_t mMostPlayed;
    CPlayingOrder mOrder;
    std::vector<std::size_t> mLastPlayed;  // of each measure, an index into the order
    std::vector<bool> mHasJumped;
    CPasses mPasses;
    CLastJump mJump;
    bool mIsEndingChosen = false;
};

}  // namespace

CPlayingOrder PlayInOrder(TMarksOfMeasures marks) {
    return CScorePlayer(marks).Play();
}

}  // namespace brindle
