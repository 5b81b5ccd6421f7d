// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/FindFingerings.h"
#include "brindle/guitarchords/internal/HandOf.h"

#include <cstdint>
#include <vector>

namespace brindle {

inline constexpr int kHighestMidi = 127;

/// What FindFingerings is to find, made ready for the search. Keys are bits of key numbers.
struct CFingeringTask {
    GChShortTuning mTuning{};
    int mStrings = 0;
    int mCapo = 0;
    int mRoot = 0;
    int mBass = 0;
    CSemitones mSemitones;
    CSemitones mMayBeOmitted;
    bool mBassIsRequired = false;
    /// Whether the lowest note matters for the order.
    bool mBassCounts = true;
    /// The first string is left open or muted.
    bool mHasShortString = false;
    /// The tones of the chord are the same above more than one of them.
    bool mIsSymmetric = false;
    std::uint32_t mKeys = 0;
    std::uint32_t mNeededKeys = 0;
    CFingeringOptions mOptions;

    /// Of a string at a fret.
    [[nodiscard]] int KeyAt(int string, int fret) const {
        return (mTuning[static_cast<std::size_t>(string)] + mCapo + fret) % 12;
    }
    /// Whether a string at a fret sounds a tone of the chord or its bass.
    [[nodiscard]] bool Allows(int string, int fret) const {
        const bool isThere = fret == 0 || string > 0 || !mHasShortString;
        return isThere && (mKeys >> KeyAt(string, fret) & 1U) != 0;
    }
};

/// Writes down what sounds: the omitted tones and whether the bass is lowest. False when the lowest
/// note is not what it has to be, or a pitch is none.
[[nodiscard]] bool SetSound(CFingering& fingering, const CFingeringTask& task);

/// Writes down the fingers and how hard they are.
void SetHand(CFingering& fingering, const CHand& hand);

/// Less cost first; of equal ones the order of frets, so that the result is always the same.
[[nodiscard]] bool IsBetterFingering(const CFingering& a, const CFingering& b);

/// The fingerings of a task with their fingers, omitted tones, difficulty and cost, in no order: at
/// least the best mOptions.mLimit ones of all.
[[nodiscard]] std::vector<CFingering> SearchFingerings(const CFingeringTask& task);

}  // namespace brindle
