// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/KeyChanges.h"

namespace brindle {
namespace {

double LargestPoints(const TFifths& points) {
    double largest = points[0];
    for (const double one : points) largest = LargerPoints(largest, one);
    return largest;
}

/// The best that can be had by a change into a key with each signature from another signature. A
/// signature counts as far away from itself, too: to stay is never worse than that.
TFifths BestFromElsewhere(const CPointsOfKeys& best, const CChangeCosts& costs) {
    TFifths better;
    for (std::size_t i = 0; i < kFifths; ++i)
        better[i] = LargerPoints(best.mMajor[i], best.mMinor[i]);
    const double far = LargestPoints(better) - costs.mBySteps[3];
    // Where the circle closes, it goes on: two more on both sides.
    std::array<double, kFifths + 4> around;
    for (std::size_t i = 0; i < kFifths; ++i) around[i + 2] = better[i];
    for (std::size_t i = 0; i < 2; ++i) {
        around[i] = better[i + kFifths - 2];
        around[i + kFifths + 2] = better[i];
    }
    TFifths found;
    for (std::size_t i = 0; i < kFifths; ++i) {
        const double near = LargerPoints(around[i + 1], around[i + 3]) - costs.mBySteps[1];
        const double apart = LargerPoints(around[i], around[i + 4]) - costs.mBySteps[2];
        found[i] = LargerPoints(LargerPoints(near, apart), far);
    }
    return found;
}

/// The circle turned: what stands so many steps up comes to the begin.
TFifths Turned(const TFifths& points, std::size_t steps) {
    TFifths moved;
    for (std::size_t i = 0; i + steps < kFifths; ++i) moved[i] = points[i + steps];
    for (std::size_t i = 0; i < steps; ++i) moved[kFifths - steps + i] = points[i];
    return moved;
}

}  // namespace

void ChangeKeys(const CPointsOfKeys& best, const CChangeCosts& costs, CPointsOfKeys& changed) {
    const TFifths elsewhere = BestFromElsewhere(best, costs);
    // The parallel minor key has three signs less, which is nine steps up.
    const TFifths parallelMinor = Turned(best.mMinor, kFifths - 3);
    const TFifths parallelMajor = Turned(best.mMajor, 3);
    for (std::size_t i = 0; i < kFifths; ++i) {
        const double change =
            LargerPoints(best.mMinor[i] - costs.mBySteps[0], parallelMinor[i] - costs.mParallel);
        changed.mMajor[i] = LargerPoints(elsewhere[i], change);
    }
    for (std::size_t i = 0; i < kFifths; ++i) {
        const double change =
            LargerPoints(best.mMajor[i] - costs.mBySteps[0], parallelMajor[i] - costs.mParallel);
        changed.mMinor[i] = LargerPoints(elsewhere[i], change);
    }
}

}  // namespace brindle
