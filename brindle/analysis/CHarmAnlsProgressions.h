// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsProgression.h"

#include <iosfwd>
#include <vector>

namespace brindle {

/// A table of progressions, and the search for those that match a place of a chord list.
class CHarmAnlsProgressions : public std::vector<CHarmAnlsProgression> {
public:
    /// A place in the list of chords.
    using chord_iterator = CHarmAnlsProgression::chord_iterator;
    using std::vector<CHarmAnlsProgression>::vector;

    /// Movements that end on a tonic or imply one, such as V I and I IV. Built on first use.
    [[nodiscard]] static const CHarmAnlsProgressions& TonicProgressions();
    /// Cadences, such as II V I. Built on first use.
    [[nodiscard]] static const CHarmAnlsProgressions& CadenceProgressions();

    /// All rows that match at `it`, sorted. Empty for an unknown direction.
    [[nodiscard]] CHarmAnlsProgressions FindAndSortMatchingProgressions(
        chord_iterator it, const CHarmAnlsChords& chords, TMatchDirection direction) const;
    /// The rows that match from `it` on, sorted.
    [[nodiscard]] CHarmAnlsProgressions FindAndSortForwardMatchingProgressions(
        chord_iterator it, const CHarmAnlsChords& chords) const;
    /// The rows that match up to and with `it`, sorted.
    [[nodiscard]] CHarmAnlsProgressions FindAndSortBackwardMatchingProgressions(
        chord_iterator it, const CHarmAnlsChords& chords) const;

    /// Longer rows first, among them larger priorities first; equal rows keep their order.
    void SortBySizeAndPriority();
    /// Whether the second row is as good as the first.
    [[nodiscard]] bool HasSeveralBestMatchingProgressions() const;
    /// The first row and all that are as good. The table must be sorted.
    [[nodiscard]] CHarmAnlsProgressions GetBestMatchingProgressions() const;
    /// Sorts this table and gives its best rows.
    [[nodiscard]] CHarmAnlsProgressions SortAndGetBestMatchingProgressions();

    /// Writes a list of the rows. No strict JSON: each list ends with a comma.
    void AppendJSONString(std::ostream& stream) const;
};

/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsProgressions& progressions);

}  // namespace brindle
