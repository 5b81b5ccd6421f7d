// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovObjects.h"

#include <cstdint>
#include <span>

namespace brindle {

class VariableLengthMarkovModel;

/// How new sequences are generated.
struct TMarkovGenerateOptions {
    /// The wanted sequence: its chords are fixed, its gaps are to be filled. Free generation takes
    /// only its length.
    MarkovSequence mTemplate;
    /// Longest history to try, in symbols: 1 to that of the model.
    std::uint64_t mMaxHistoryLength = 0;
    /// Shortest history to try under a template and for the ending, 1 to the longest one; free
    /// generation goes down to 1 whatever it is.
    std::uint64_t mMinHistoryLength = 0;
    /// History length for evidence and for reaching a fixed symbol.
    std::uint64_t mEvidenceHistoryLength = 0;
    /// At the shortest history, take a symbol even if its table is not varied enough.
    bool mAcceptAtMinHistory = false;
    /// Take a symbol even if its table is not varied enough when the longest fitting symbol exactly
    /// fills the remaining gap.
    bool mAcceptExactFill = false;
    /// How varied the table of a history must be: its entropy over that of an even table, 0 to 1.
    double mMinNormalizedEntropy = 0.0;
    /// Factor on the weight of a sequence whose symbols are all equal.
    double mAllEqualFactor = 1.0;
    /// Number of accepted sequences to draw; 0 makes one attempt.
    std::uint64_t mSampleCount = 1;

    /// Limits the history lengths to what the model has; false if there is no template.
    bool Validate(const VariableLengthMarkovModel& model);
    /// Whether the longest and the shortest history and the template can be used as they are.
    [[nodiscard]] bool IsValid(const VariableLengthMarkovModel& model) const;
};

/// The usual way to a wanted sequence of chords and gaps: all histories that the model has.
[[nodiscard]] TMarkovGenerateOptions UsualGenerateOptions(VariableLengthMarkovModel& model,
                                                          std::span<const CMarkovObject> wanted);
/// The same for any sequence that lasts so many beats.
[[nodiscard]] TMarkovGenerateOptions UsualGenerateOptions(VariableLengthMarkovModel& model,
                                                          double beats);

}  // namespace brindle
