// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/internal/FingeringSearch.h"
#include "brindle/guitarchords/internal/HandOf.h"

namespace brindle {

/// The place of a fingering in the order of a player, less being better: what its sound and its
/// place on the neck cost, and what the hand does. Neither is negative.
[[nodiscard]] int CostOfSoundAndPlace(const CFingering& fingering, const CFingeringTask& task);
[[nodiscard]] int CostOfHand(const CHand& hand);

/// Of a shape, or of its strings so far.
struct CShapeCounts {
    int mPosition = 0;  ///< the lowest fret that is pressed, 0 for none
    int mHighest = 0;
    int mOpen = 0;
    int mFingers = 0;  ///< the fewest that hold it
    int mSilentBass = 0;
    int mSilentInside = 0;
};

/// What a shape costs at least, whatever its other strings do.
[[nodiscard]] int LeastCostOf(const CShapeCounts& shape);

}  // namespace brindle
