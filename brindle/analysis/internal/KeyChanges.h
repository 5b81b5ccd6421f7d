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

/// The best that can be had by a change into each key.
void ChangeKeys(const CPointsOfKeys& best, const CChangeCosts& costs, CPointsOfKeys& changed);

}  // namespace brindle
