// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/neural/ChordRootPatterns.h"
#include "brindle/platform/SeededRandom.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <vector>

namespace brindle::tools {

/// Weights between two layers, by input and then by neuron, times the slope of the net.
template <std::size_t inputs, std::size_t neurons>
using TMatrix = std::array<std::array<double, neurons>, inputs>;

/// One number for each weight of the net that hears roots.
struct CRootNetNumbers {
    TMatrix<24, 15> mFirst{};
    TMatrix<15, 15> mSecond{};
    TMatrix<15, 12> mOutput{};
};

/// Trains the net that hears roots.
///
/// The net is too small and its logistic too flat for steps along the plain gradient to get every
/// pattern right in reasonable time, so this goes another way: mini-batches, cross-entropy as the
/// error (for it the delta of an output is wanted minus value, without the logistic's derivative,
/// so that an output that is wrong and sure of it learns fastest), and steps that adapt to each
/// weight by the running mean and mean square of its gradient (Adam).
///
/// Sums, products, quotients and square roots only, in a fixed order: the result is the same on
/// every machine with IEEE doubles, if the compiler neither reorders nor fuses operations.
class RootNetTrainer {
public:
    RootNetTrainer(std::vector<CChordRootPattern> patterns, std::uint64_t seed);

    /// Learns from all patterns once, in a new random order. Returns how many it had wrong.
    std::size_t TrainCycle(double stepSize);

    /// In the order of NeuronalNet::get_weights.
    [[nodiscard]] std::vector<double> Weights() const;

private:
    void _LearnFrom(const CChordRootPattern& pattern);
    void _Step(double stepSize);

    std::vector<CChordRootPattern> mPatterns;
    SeededRandom mRandom;
    std::size_t mWrongCount = 0;
    CRootNetNumbers mWeights;
    CRootNetNumbers mGradient;  ///< summed over the batch
    CRootNetNumbers mMeanGradient;
    CRootNetNumbers mMeanSquare;
    double mMeanFading = 1.0;    ///< share that the start at 0 still has in the means
    double mSquareFading = 1.0;  ///< the same for the mean squares
};

}  // namespace brindle::tools
