// SPDX-License-Identifier: MIT
#include "brindle/markov/DrawMarkovSequences.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

// Relative to the heaviest, since the weights themselves may be too small for a number.
std::vector<double> SharesOf(const std::vector<TMarkovSampledSequence>& sequences) {
    double highest = -1e300;
    for (const auto& sequence : sequences) highest = std::max(highest, sequence.mLogProbability);
    std::vector<double> shares;
    double sum = 0.0;
    for (const auto& sequence : sequences) {
        shares.push_back(std::exp(sequence.mLogProbability - highest) * sequence.mCount);
        sum += shares.back();
    }
    for (double& share : shares) share /= sum;
    return shares;
}

}  // namespace

CMarkovDraws DrawMarkovSequences(VariableLengthMarkovModel& model,
                                 const TMarkovGenerateOptions& options) {
    CMarkovDraws draws;
    model.SampleSequenceWithLength(draws.mChosen, draws.mSequences, true, options);
    std::reverse(draws.mSequences.begin(), draws.mSequences.end());
    draws.mShares = SharesOf(draws.mSequences);
    return draws;
}

}  // namespace brindle
