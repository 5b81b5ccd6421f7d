// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/internal/FingeringSearch.h"

#include "brindle/guitarchords/internal/FingeringCost.h"
#include "brindle/guitarchords/internal/HandOf.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cstddef>
#include <limits>

namespace brindle {
namespace {

constexpr int kMostSpan = 7;
constexpr int kFewestSounding = 3;
// A guitar needs some thousands in a position; 12 strings have millions of ways.
constexpr int kMostStepsInPosition = 40'000;
// The best of those that were found are kept each time a quarter more has come. What is worse is
// left early then, so few wanted ones are found soon.
constexpr std::size_t kFewestKept = 16;

/// What can be done with a string in a position: at most each fret under the hand, open, muted.
struct CStringWays {
    std::array<std::int8_t, kMostSpan + 2> mFrets{};
    int mCount = 0;

    void Add(int fret) {
        mFrets[static_cast<std::size_t>(mCount++)] = static_cast<std::int8_t>(fret);
    }
};

/// What is known of a shape on its way from string to string.
struct CShapeState {
    std::uint32_t mKeys = 0;
    int mSounding = 0;
    /// Muted strings since the last one that sounds.
    int mMutes = 0;
    CShapeCounts mCounts;
    int mLastFret = kMutedString;
    bool mHasLowest = false;
    /// A barre at the lowest fret may go on.
    bool mBarreIsOpen = false;
};

class CFingeringSearch {
public:
    explicit CFingeringSearch(const CFingeringTask& task) : mTask(task) {
        const int highest = std::clamp(task.mOptions.mHighestFret, 1, kFingeringMostFrets);
        mHighestFret = std::max(1, highest - task.mCapo);
        const int tones = std::popcount(task.mNeededKeys);
        mFewestSounding = std::min(kFewestSounding, std::max(tones, 2));
        mKept = std::max(task.mOptions.mLimit, kFewestKept);
    }

    std::vector<CFingering> Find() {
        // Up the neck each fingering costs more, so there is an end before that of the neck.
        for (int position = 0; position <= mHighestFret; ++position) {
            if (LeastCostOf({.mPosition = position, .mHighest = position}) > mWorstCost) break;
            FindInPosition(position);
        }
        return std::move(mFound);
    }

private:
    /// Position 0 has open strings only.
    void FindInPosition(int position) {
        mPosition = position;
        mSteps = 0;
        const CFingeringOptions& options = mTask.mOptions;
        const int span = std::clamp(
            position >= kFingeringUpTheNeck ? options.mSpanUpTheNeck : options.mSpan, 2, kMostSpan);
        const int last = std::min(mHighestFret, position + span - 1);
        for (int string = 0; string < mTask.mStrings; ++string) {
            CStringWays& ways = mWays[static_cast<std::size_t>(string)];
            ways.mCount = 0;
            for (int fret = position; fret <= last && position > 0; ++fret) {
                if (mTask.Allows(string, fret)) ways.Add(fret);
            }
            if (mTask.Allows(string, 0)) ways.Add(0);
            if ((options.mMutable >> string & 1U) != 0) ways.Add(kMutedString);
        }
        mLastLowest = LastStringAt(position);
        CShapeState start;
        start.mCounts.mPosition = position;
        if (position == 0 || mLastLowest >= 0) GoOn(0, start);
    }

    /// The last string that can be pressed at the fret; -1 for none.
    [[nodiscard]] int LastStringAt(int fret) const {
        int string = mTask.mStrings - 1;
        while (string >= 0 && !mTask.Allows(string, fret)) --string;
        return string;
    }

    void GoOn(int string, const CShapeState& state) {
        if (++mSteps > kMostStepsInPosition) return;
        if (string == mTask.mStrings) {
            Keep();
            return;
        }
        const CStringWays& ways = mWays[static_cast<std::size_t>(string)];
        for (int i = 0; i < ways.mCount; ++i) {
            const int fret = ways.mFrets[static_cast<std::size_t>(i)];
            CShapeState next = state;
            Take(string, fret, next);
            if (mPosition > 0 && !next.mHasLowest && string >= mLastLowest) continue;
            if (!CanBecomeChord(next, mTask.mStrings - string - 1)) continue;
            mFrets[static_cast<std::size_t>(string)] = static_cast<std::int8_t>(fret);
            GoOn(string + 1, next);
        }
    }

    void Take(int string, int fret, CShapeState& state) const {
        if (fret > 0 && IsNewFinger(fret, state)) ++state.mCounts.mFingers;
        if (fret == mPosition && fret > 0) state.mHasLowest = state.mBarreIsOpen = true;
        if (fret <= 0) state.mBarreIsOpen = false;
        state.mLastFret = fret;
        if (fret == kMutedString) {
            ++state.mMutes;
            return;
        }
        CShapeCounts& counts = state.mCounts;
        (state.mSounding > 0 ? counts.mSilentInside : counts.mSilentBass) += state.mMutes;
        counts.mHighest = std::max(counts.mHighest, fret);
        if (fret == 0) ++counts.mOpen;
        state.mMutes = 0;
        ++state.mSounding;
        state.mKeys |= 1U << mTask.KeyAt(string, fret);
    }

    [[nodiscard]] bool IsNewFinger(int fret, const CShapeState& state) const {
        return fret == mPosition ? !state.mBarreIsOpen : fret != state.mLastFret;
    }

    [[nodiscard]] bool CanBecomeChord(const CShapeState& state, int stringsLeft) const {
        return state.mCounts.mFingers <= kHandFingers &&
               state.mCounts.mSilentInside <= mTask.mOptions.mMostInnerMutes &&
               state.mSounding + stringsLeft >= mFewestSounding &&
               std::popcount(mTask.mNeededKeys & ~state.mKeys) <= stringsLeft &&
               LeastCostOf(state.mCounts) <= mWorstCost;
    }

    void Keep() {
        const std::span<const std::int8_t> frets(mFrets.data(),
                                                 static_cast<std::size_t>(mTask.mStrings));
        CFingering fingering;
        fingering.mTuning = mTask.mTuning;
        fingering.mCapo = mTask.mCapo;
        fingering.mStringCount = mTask.mStrings;
        std::copy(frets.begin(), frets.end(), fingering.mFrets.begin());
        if (!SetSound(fingering, mTask)) return;
        const int cost = CostOfSoundAndPlace(fingering, mTask);
        if (cost > mWorstCost) return;
        const auto hand = HandOf(frets);
        if (!hand) return;
        fingering.mCost = cost + CostOfHand(*hand);
        if (fingering.mCost > mWorstCost) return;
        SetHand(fingering, *hand);
        mFound.push_back(fingering);
        if (mFound.size() == mKept + mKept / 4) KeepBest();
    }

    void KeepBest() {
        const auto last = mFound.begin() + static_cast<std::ptrdiff_t>(mKept) - 1;
        std::nth_element(mFound.begin(), last, mFound.end(), IsBetterFingering);
        mWorstCost = last->mCost;
        mFound.resize(mKept);
    }

    const CFingeringTask& mTask;
    int mHighestFret = 0;
    int mFewestSounding = 0;
    std::size_t mKept = 0;
    /// More than this is not among the best.
    int mWorstCost = std::numeric_limits<int>::max();
    int mPosition = 0;
    int mLastLowest = 0;
    int mSteps = 0;
    std::array<CStringWays, kFingeringMostStrings> mWays{};
    std::array<std::int8_t, kGChMaxStrings> mFrets{};
    std::vector<CFingering> mFound;
};

}  // namespace

bool SetSound(CFingering& fingering, const CFingeringTask& task) {
    int lowest = kHighestMidi + 1;
    CSemitones sounding;
    for (int string = 0; string < fingering.mStringCount; ++string) {
        const int pitch = fingering.Pitch(string);
        if (pitch > kHighestMidi) return false;
        if (pitch < 0) continue;
        lowest = std::min(lowest, pitch);
        sounding.AddIntvl(pitch - task.mRoot);
    }
    fingering.mBassIsLowest = lowest % 12 == task.mBass;
    fingering.mOmitted = task.mSemitones - sounding;
    return fingering.mBassIsLowest || !task.mBassIsRequired;
}

void SetHand(CFingering& fingering, const CHand& hand) {
    fingering.mFingers = hand.mPlaces;
    fingering.mFingerCount = hand.mCount;
    fingering.mDifficulty = DifficultyOf(hand);
}

bool IsBetterFingering(const CFingering& a, const CFingering& b) {
    return a.mCost != b.mCost ? a.mCost < b.mCost : a.mFrets < b.mFrets;
}

std::vector<CFingering> SearchFingerings(const CFingeringTask& task) {
    return CFingeringSearch(task).Find();
}

}  // namespace brindle
