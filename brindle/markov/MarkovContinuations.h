// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/VariableLengthMarkovModel.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace brindle {

/// What a model has learned of the histories of one length.
struct CMarkovHistories {
    std::size_t mLength = 0;  ///< symbols of a history, from 1
    std::size_t mCount = 0;   ///< different histories of this length
    /// How open it is what follows, and how open it could be at most with as many continuations:
    /// means over all places of what was learned, in natural units.
    double mEntropy = 0.0;
    double mMaxEntropy = 0.0;  ///< that of continuations which are all as likely
};

/// For each length from 1 to that of the model.
[[nodiscard]] std::vector<CMarkovHistories> HistoriesByLength(
    const VariableLengthMarkovModel& model);

/// A symbol that has followed a history.
struct CMarkovContinuation {
    MarkovIterator mSymbol;    ///< where it stands in what was learned
    std::uint32_t mCount = 0;  ///< how often it followed
    /// 0 to 1.
    double mProbability = 0.0;
};

/// What has followed the history, the most frequent first. From the history is taken off, at its
/// begin, what the model never met; it is empty if the model does not know its last symbol.
[[nodiscard]] std::vector<CMarkovContinuation> MarkovContinuations(
    const VariableLengthMarkovModel& model, MarkovSequence& history);

}  // namespace brindle
