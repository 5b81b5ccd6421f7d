// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovObjects.h"

#include <cstdint>
#include <iosfwd>
#include <vector>

namespace brindle {

/// A generated symbol and how it was chosen.
struct TMarkovSampledObject {
    double mProbability = 0.0;  ///< in the table that it was chosen from, 0 to 1
    /// Entropy of the table that the symbol was chosen from over that of an even table, 0 to 1; not
    /// a number for a table of one entry.
    double mNormalizedEntropy = 0.0;
    /// Natural logarithm of the number of entries of the table.
    double mMaxEntropy = 0.0;
    std::uint64_t mHistoryLength = 0;  ///< symbols of the history whose table it was
    MarkovIterator mObject;            ///< the symbol, in the store of the model

    /// By symbol; equal symbols by probability.
    friend bool operator<(const TMarkovSampledObject& a, const TMarkovSampledObject& b);
};

/// A generated sequence. The three lists have an element for each symbol.
struct TMarkovSampledSequence {
    /// The normalized entropies.
    std::vector<double> mEntropies;
    std::vector<TMarkovSampledObject> mSampledObjects;  ///< how each symbol was chosen
    MarkovSequence mSymbols;                            ///< what sounds, in the order of time
    /// The weight as a natural logarithm.
    double mLogProbability = 0.0;
    /// How often the sequence was drawn.
    std::int32_t mCount = 1;

    /// Whether every two symbols are equal in all fields; true for one symbol or none.
    [[nodiscard]] bool AllElementsAreEqual() const;
    /// The sum of mEntropies.
    [[nodiscard]] double SumOfEntropies() const;

    /// Adds the symbol to all three lists.
    void Append(const TMarkovSampledObject& object);
    /// Takes off the last symbol, if there is one.
    void RemoveLast();

    /// By count, number of symbols, symbols, weight and sum of entropies.
    friend bool operator<(const TMarkovSampledSequence& a, const TMarkovSampledSequence& b);
};

/// Whether `a` weighs less than `b`, each drawn as often as it was; then by `operator<`.
[[nodiscard]] bool CompareSequencesByWeightAndEntropy(const TMarkovSampledSequence& a,
                                                      const TMarkovSampledSequence& b);

/// Writes all fields on one line, for debugging.
std::ostream& operator<<(std::ostream& stream, const TMarkovSampledObject& object);
/// Writes count and weight, then each symbol on a line of its own.
std::ostream& operator<<(std::ostream& stream, const TMarkovSampledSequence& sequence);

/// A sequence in the list from which one is chosen.
struct CMarkovWeightedSequence {
    TMarkovSampledSequence mSequence;  ///< without its place in the list
    /// A natural logarithm until NormalizeLogProbabilities, then 0 to 1.
    double mWeight = 0.0;
};

}  // namespace brindle
