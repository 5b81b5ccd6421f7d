// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/internal/PlayMarks.h"

#include <cstddef>
#include <cstdint>
#include <limits>
#include <map>
#include <span>
#include <vector>

namespace brindle {

inline constexpr std::size_t kNoMeasure = std::numeric_limits<std::size_t>::max();

/// The marks of each measure, in the order in which they are written.
using TMarksOfMeasures = std::span<const CPlayMarks>;

/// One ending of a repeat: the measures under one bracket, up to the sign that goes back.
struct CEnding {
    std::size_t mFirst = 0;
    std::size_t mLast = 0;
    std::vector<std::int32_t> mNumbers;
    std::size_t mGroup = 0;
    bool mGoesBack = false;
};

/// Endings side by side, of which each pass plays one.
struct CEndingGroup {
    std::size_t mFirstEnding = 0;
    std::size_t mEndingCount = 0;
    /// Where the repeat goes back to.
    std::size_t mRepeatStart = 0;
    /// The measure behind the last ending.
    std::size_t mBehind = 0;
    /// The first ending with a Fine, and with a way to the coda; kNoMeasure for none.
    std::size_t mEndingWithFine = kNoMeasure;
    std::size_t mEndingWithToCoda = kNoMeasure;
    /// The endings by the passes they are for.
    std::map<std::int32_t, std::size_t> mEndingOfPass;
    bool mIsForAfterJump = false;

    [[nodiscard]] std::int32_t HighestNumber() const {
        return mEndingOfPass.empty() ? 0 : mEndingOfPass.rbegin()->first;
    }
};

/// What a measure is for the player.
struct CMeasurePlan {
    /// Where its backward repeat goes, kNoMeasure without one.
    std::size_t mRepeatStart = kNoMeasure;
    /// The measure that ends the repeat around this one, itself included; kNoMeasure for none.
    std::size_t mRepeatEnd = kNoMeasure;
    /// How often the repeat that ends here is played.
    std::int32_t mRepeatTimes = 2;
    /// Index into the endings, kNoMeasure for none.
    std::size_t mEnding = kNoMeasure;
    /// Where D.C. or D.S. at its end lead.
    std::size_t mJumpTarget = kNoMeasure;
    /// Where "To Coda" at its end leads.
    std::size_t mCodaTarget = kNoMeasure;
};

/// All ways through a song, told from its marks.
struct CJumpPlan {
    std::vector<CMeasurePlan> mMeasures;
    std::vector<CEnding> mEndings;
    std::vector<CEndingGroup> mGroups;

    /// Null for a measure in no ending.
    [[nodiscard]] const CEnding* EndingAt(std::size_t ix) const {
        const std::size_t ending = mMeasures[ix].mEnding;
        return ending == kNoMeasure ? nullptr : &mEndings[ending];
    }
    [[nodiscard]] const CEndingGroup& GroupOf(const CEnding& ending) const {
        return mGroups[ending.mGroup];
    }
};

[[nodiscard]] CJumpPlan MakeJumpPlan(TMarksOfMeasures marks);

/// The first steps of making a plan: its endings and their groups, then its repeats. The plan has
/// its measures.
void PlanEndings(TMarksOfMeasures marks, CJumpPlan& plan);
void PlanRepeats(TMarksOfMeasures marks, CJumpPlan& plan);

}  // namespace brindle
