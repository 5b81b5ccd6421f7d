// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/KeyCircle.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <limits>
#include <utility>

namespace brindle {

// What a modulation, a change of key within a song, costs: the more, the farther the two signatures
// lie apart on the circle of fifths.

// What a change costs more to the parallel key, or for each fifth between the signatures. Beyond
// three fifths the signatures are far enough.
inline constexpr double kParallelCost = 1.0;
inline constexpr double kFifthCost = 0.5;
inline constexpr std::size_t kMostFifths = 3;

/// The costs of a change, by the steps between the signatures, and to the parallel key.
class CChangeCosts {
public:
    explicit CChangeCosts(double base) : mParallel(base + kParallelCost) {
        for (std::size_t steps = 0; steps <= kMostFifths; ++steps) {
            mBySteps[steps] = base + kFifthCost * static_cast<double>(steps);
        }
        for (std::size_t i = 0; i < 2 * kFifths; ++i) {
            const std::size_t up = i % kFifths;
            mSameMode[i] = up == 0 ? kNoChange : mBySteps[StepsOf(up)];
            mToMajor[i] = up == kMinorOfParallel ? mParallel : mBySteps[StepsOf(up)];
            mToMinor[i] = up == kFifths - kMinorOfParallel ? mParallel : mBySteps[StepsOf(up)];
        }
    }

    /// The costs of a change into a key from the major and from the minor keys, each in the order
    /// of the circle.
    [[nodiscard]] std::pair<const double*, const double*> Into(int key) const {
        const std::size_t begin = kFifths - SignatureOf(key);
        const double* same = mSameMode.data() + begin;
        return IsMinorKey(key) ? std::pair(mToMinor.data() + begin, same)
                               : std::pair(same, mToMajor.data() + begin);
    }

    std::array<double, kMostFifths + 1> mBySteps;
    double mParallel;

private:
    // The signature of the parallel minor key has three signs less.
    static constexpr std::size_t kMinorOfParallel = kFifths - 3;
    static constexpr double kNoChange = std::numeric_limits<double>::infinity();

    static std::size_t StepsOf(std::size_t up) { return std::min({up, kFifths - up, kMostFifths}); }

    // By how far the signature that is left lies up from the one that is entered.
    TTwiceFifths mSameMode;
    TTwiceFifths mToMajor;
    TTwiceFifths mToMinor;
};

inline double LargestPoints(const TFifths& points) {
    double largest = points[0];
    for (const double one : points) largest = LargerPoints(largest, one);
    return largest;
}

/// The best that can be had by a change into a key with each signature from another signature. A
/// signature counts as far away from itself, too: to stay is never worse than that.
inline TFifths BestFromElsewhere(const CPointsOfKeys& best, const CChangeCosts& costs) {
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
inline TFifths Turned(const TFifths& points, std::size_t steps) {
    TFifths moved;
    for (std::size_t i = 0; i + steps < kFifths; ++i) moved[i] = points[i + steps];
    for (std::size_t i = 0; i < steps; ++i) moved[kFifths - steps + i] = points[i];
    return moved;
}

/// The best that can be had by a change into each key.
inline void ChangeKeys(const CPointsOfKeys& best, const CChangeCosts& costs,
                       CPointsOfKeys& changed) {
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
