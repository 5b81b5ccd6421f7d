// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsCenter.h"

#include <iosfwd>
#include <vector>

namespace brindle {

/// The harmonic centers under one sign key, in the order of time. The range of a center ends where
/// the next one begins, that of the last one at `kPosEnd`.
class CHarmAnlsCenters : public std::vector<CHarmAnlsCenter> {
public:
    using std::vector<CHarmAnlsCenter>::vector;

    /// The center of the entry that sorts last by key among B major and the centers of the list,
    /// if the list spends time in it, else the undefined center. The name promises more.
    [[nodiscard]] CHarmCenterLite FindMostOccurentHarmCenter() const;

    /// Gives the center at `it` the range between the two positions (in any order): chords that
    /// now fall outside go to its neighbours, which are made where they are missing, and the chords
    /// of all centers that fall inside come in. Returns the iterator to the same center.
    iterator ChangeRangeOfHarmCenter(iterator it, double start, double end);
    /// Moves all chords from `pos` on into the center behind `it`, which is made if it is missing.
    /// Returns the iterator to the same center.
    iterator CreateNewHarmCenterWithChordsAfterPos(iterator it, double pos);
    /// Takes the chords with smaller <= position < larger out of all centers, and with them an
    /// undefined chord at exactly `larger`: an end marker belongs to what ends there.
    CHarmAnlsChords CollectAndEraseChordsFromSmallerUntilBeforeLarger(double smaller,
                                                                      double larger);

    /// Joins neighbours of the same key, spelling and mask; the first keeps its position and
    /// probability.
    void MergeAdjacentSameHarmCenters();
    /// Appends the chords of `second` to `first` and erases `second`. Returns the iterator behind.
    iterator _MergeHarmCentersAndEraseSecond(iterator first, iterator second);

    /// Writes a list of the centers. No strict JSON: each list ends with a comma.
    void AppendJSONString(std::ostream& stream) const;
};

/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsCenters& centers);

}  // namespace brindle
