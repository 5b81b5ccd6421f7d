// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/VariableLengthMarkovModel.h"

#include <vector>

namespace brindle {

/// What was drawn from a model.
struct CMarkovDraws {
    /// Empty if the model has no such sequence.
    TMarkovSampledSequence mChosen;
    /// All different ones, the heaviest first.
    std::vector<TMarkovSampledSequence> mSequences;
    /// The part of all weight that each of them has, 0 to 1.
    std::vector<double> mShares;
};

/// Draws sequences under the template of the options, which Validate has looked at.
[[nodiscard]] CMarkovDraws DrawMarkovSequences(VariableLengthMarkovModel& model,
                                               const TMarkovGenerateOptions& options);

}  // namespace brindle
