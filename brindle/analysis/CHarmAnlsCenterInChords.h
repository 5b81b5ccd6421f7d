// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsCenter.h"
#include "brindle/theory/CHarmCenterLite.h"

#include <cstddef>
#include <utility>
#include <vector>

namespace brindle {

/// A harmonic center over a range of a chord list. The iterators point into that list and are
/// valid only while it stays as it is.
class CHarmAnlsCenterInChords {
public:
    /// A place in the list of chords.
    using chord_iterator = CHarmAnlsChords::const_iterator;

    CHarmCenterLite mCenter;  ///< the tonic and its scale
    chord_iterator mBegin{};  ///< the first chord
    /// One behind the last chord.
    chord_iterator mEnd{};

    /// Same range; the centers do not matter.
    [[nodiscard]] bool IsSimultaneousWith(const CHarmAnlsCenterInChords& other) const;
    /// How many chords it has; mBegin must not lie behind mEnd.
    [[nodiscard]] std::size_t ChordsCount() const;
    /// Whether this range has more chords and the other lies inside it.
    [[nodiscard]] bool IsLongerAndContains(const CHarmAnlsCenterInChords& other) const;
    /// Whether a place lies from mBegin to mEnd, both included.
    [[nodiscard]] bool _IteratorInsideBeginAndEnd(chord_iterator it) const;

    /// Grows the range to both sides over the chords that the center tolerates. The last chord of
    /// the list is never taken in.
    void ExtendForAdjacentDiatonicOrAllowedOutlierChords(const CHarmAnlsChords& chords);
    /// The center with its chords and the position of the first one; undefined and empty if the
    /// key is undefined or the range begins at the end of the list.
    [[nodiscard]] CHarmAnlsCenter ToHarmAnlsCenter(const CHarmAnlsChords& chords) const;

    friend bool operator==(const CHarmAnlsCenterInChords&,
                           const CHarmAnlsCenterInChords&) = default;
};

/// The centers of one reading of a chord list.
class CHarmAnlsCentersInChords : public std::vector<CHarmAnlsCenterInChords> {
public:
    /// A place in the list of chords.
    using chord_iterator = CHarmAnlsCenterInChords::chord_iterator;
    using std::vector<CHarmAnlsCenterInChords>::vector;

    /// Removes each element that another one of the list contains and outlasts.
    void RemoveShorterContainedHarmCenters();
    /// Whether another element contains and outlasts the one at `it`.
    [[nodiscard]] bool HasLongerContainingHarmCenter(const_iterator it) const;
    /// Whether some element contains and outlasts some element of the other list.
    [[nodiscard]] bool IsLongerAndContains(const CHarmAnlsCentersInChords& other) const;
    /// Whether some element contains and outlasts the given one.
    [[nodiscard]] bool HasCenterThatIsLongerAndContains(
        const CHarmAnlsCenterInChords& element) const;
    /// The first element with the same key, spelling and mask, or the end.
    [[nodiscard]] const_iterator FindCenterMatching(const CHarmAnlsCenterInChords& center) const;
    /// Whether the first element with the same center is longer and contains the given range. A
    /// range of the same length does not count, whatever the name says.
    [[nodiscard]] bool ContainsSameCenterWithSameOrLongerChords(
        const CHarmAnlsCenterInChords& element) const;
    /// The smallest begin and the largest end; null iterators for an empty list.
    [[nodiscard]] std::pair<chord_iterator, chord_iterator> OverallBeginAndEndInputChord() const;
};

}  // namespace brindle
