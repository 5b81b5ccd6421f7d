// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/JumpPlan.h"

#include <algorithm>

namespace brindle {

namespace {

/// A repeat goes back to the sign that begins it, or else behind the repeat before it.
class CRepeats {
public:
    CRepeats(TMarksOfMeasures marks, CJumpPlan& plan) : mMarks(marks), mPlan(plan) {}

    void Plan() {
        for (std::size_t ix = 0; ix < mMarks.size(); ++ix) {
            BeginAt(ix);
            if (GoesBack(ix)) PlanWayBack(ix);
            if (IsEndOfRepeat(ix)) BeginBehind(ix);
        }
        FindEnds();
    }

private:
    void BeginAt(std::size_t ix) {
        const CEnding* ending = mPlan.EndingAt(ix);
        if (mMarks[ix].mRepeatForward && ending == nullptr) {
            mStart = ix;
            mTimesAtStart = mMarks[ix].mRepeatTimes;
        }
        if (ending == nullptr || ix != ending->mFirst) return;
        CEndingGroup& group = mPlan.mGroups[ending->mGroup];
        if (group.mFirstEnding == mPlan.mMeasures[ix].mEnding) group.mRepeatStart = mStart;
    }

    [[nodiscard]] bool GoesBack(std::size_t ix) const {
        const CEnding* ending = mPlan.EndingAt(ix);
        const bool endsEnding = ending != nullptr && ix == ending->mLast;
        return mMarks[ix].mRepeatBackward || (endsEnding && ending->mGoesBack);
    }

    void PlanWayBack(std::size_t ix) {
        const CEnding* ending = mPlan.EndingAt(ix);
        CMeasurePlan& measure = mPlan.mMeasures[ix];
        measure.mRepeatStart = ending == nullptr ? mStart : mPlan.GroupOf(*ending).mRepeatStart;
        measure.mRepeatTimes = TimesAt(ix, ending);
    }

    [[nodiscard]] std::int32_t TimesAt(std::size_t ix, const CEnding* ending) const {
        const std::int32_t times = mMarks[ix].mRepeatTimes;
        const std::int32_t told = times != 0 ? times : mTimesAtStart;
        if (ending == nullptr) return told != 0 ? told : 2;
        return std::max(told, mPlan.GroupOf(*ending).HighestNumber());
    }

    // With endings a repeat ends behind the last of them, whether that goes back or not.
    [[nodiscard]] bool IsEndOfRepeat(std::size_t ix) const {
        const CEnding* ending = mPlan.EndingAt(ix);
        if (ending == nullptr) return mMarks[ix].mRepeatBackward;
        return mPlan.GroupOf(*ending).mBehind == ix + 1;
    }

    void BeginBehind(std::size_t ix) {
        mStart = ix + 1;
        if (GoesBack(ix)) mTimesAtStart = 0;
    }

    // For a measure before the endings, the first of them stands for all.
    void FindEnds() {
        std::size_t end = kNoMeasure;
        for (std::size_t ix = mMarks.size(); ix-- > 0;) {
            CMeasurePlan& measure = mPlan.mMeasures[ix];
            if (measure.mRepeatStart != kNoMeasure) end = ix;
            if (end == kNoMeasure || mPlan.mMeasures[end].mRepeatStart > ix) continue;
            if (measure.mEnding == kNoMeasure || measure.mEnding == mPlan.mMeasures[end].mEnding) {
                measure.mRepeatEnd = end;
            }
        }
    }

    TMarksOfMeasures mMarks;
    CJumpPlan& mPlan;
    std::size_t mStart = 0;
    std::int32_t mTimesAtStart = 0;
};

}  // namespace

void PlanRepeats(TMarksOfMeasures marks, CJumpPlan& plan) {
    CRepeats(marks, plan).Plan();
}

}  // namespace brindle
