// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovObjects.h"

#include <vector>

namespace brindle {

/// The fixed symbols of a template, to be found by position.
class CMarkovTemplate {
public:
    /// `endSymbol` stands behind the template.
    CMarkovTemplate(MarkovSequenceView symbols, MarkovIterator endSymbol);

    struct CNext {
        MarkovIterator mObject;
        /// From the position that was asked for.
        double mDistance = 0.0;
    };
    /// The first fixed symbol at or after `beats`, or the end symbol at the template's length.
    [[nodiscard]] CNext NextAt(double beats) const;
    /// Whether a chord of the template stands at exactly this position.
    [[nodiscard]] bool HasChordAt(double beats) const;

private:
    struct CFixed {
        MarkovIterator mObject;
        double mPosition = 0.0;
        /// The highest position up to here: they need not ascend, since lengths may be negative.
        double mReached = 0.0;
    };
    std::vector<CFixed> mFixed;
    /// Ascending.
    std::vector<double> mChordPositions;
    MarkovIterator mEndSymbol;
    double mLength = 0.0;
};

}  // namespace brindle
