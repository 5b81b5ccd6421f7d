// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsCenterInChords.h"

#include <functional>
#include <vector>

namespace brindle {

/// One reading of a chord list, and how likely it is among those over the same range.
class CHarmAnlsCenterAlternative {
public:
    /// 0 to 1; more where equal readings were added up.
    double mProbability = 0.0;
    CHarmAnlsCentersInChords mCenters;  ///< the centers of this reading

    /// Removes each center that another one of this reading contains and outlasts.
    void RemoveShorterContainedHarmCenters() { mCenters.RemoveShorterContainedHarmCenters(); }
    /// Whether both readings cover the same range as a whole.
    [[nodiscard]] bool IsSimultaneousWith(const CHarmAnlsCenterAlternative& other) const;
    /// Whether a center of this reading contains and outlasts a center of the other.
    [[nodiscard]] bool IsLongerContainingAlternativeFor(
        const CHarmAnlsCenterAlternative& other) const;

    friend bool operator==(const CHarmAnlsCenterAlternative&,
                           const CHarmAnlsCenterAlternative&) = default;
};

/// Readings of one and the same chord list.
class CHarmAnlsCenterAlternatives : public std::vector<CHarmAnlsCenterAlternative> {
public:
    using std::vector<CHarmAnlsCenterAlternative>::vector;

    /// Erases, one after the other, each reading for which another one that is still there has a
    /// longer center that contains one of its centers.
    void RemoveShorterContainedAlternatives();
    /// All other readings over the same range as the one at `it`.
    [[nodiscard]] std::vector<std::reference_wrapper<CHarmAnlsCenterAlternative>>
    FindSimultaneousAlternatives(iterator it);
    /// Whether another reading is an IsLongerContainingAlternativeFor the one at `it`.
    [[nodiscard]] bool HasLongerContainingAlternernative(const_iterator it) const;
    /// Readings over the same range share the probability equally; a reading that is alone over its
    /// range keeps what it has.
    void RecalculateProbabilitiesOfSimultaneousAlternatives();
    /// Inside each reading.
    void RemoveShorterContainedHarmCenters();
    /// Keeps the first of equal readings, with the sum of their probabilities, and recalculates.
    void Deduplication();
    /// Erases the readings behind one of probability 1 that have the same ranges.
    void RemoveNonSureAlternativesWithSameRangeAsSureAlternative();
};

}  // namespace brindle
