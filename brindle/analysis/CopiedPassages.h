// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmCopy.h"

#include <cstdint>
#include <vector>

namespace brindle {

class CHarmonicAnalyse;

/// A copy together with the chords that it is made of: bars and beats of a CHarmCopy are cut to
/// whole numbers, these are exact.
struct CCopiedPassage {
    CHarmCopy mCopy;  ///< in bars and beats
    /// Number of the first chord of the source in the list `mChords`, from 0.
    std::uint64_t mSource = 0;
    /// Number of the first chord of the copy.
    std::uint64_t mTarget = 0;
    /// How many chords each of the two has.
    std::uint64_t mCount = 0;
};

/// The copies that CHarmonicAnalyse::FindHarmCopies finds, in the same order.
[[nodiscard]] std::vector<CCopiedPassage> FindCopiedPassages(const CHarmonicAnalyse& analyse);

}  // namespace brindle
