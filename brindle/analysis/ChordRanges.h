// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"

#include <algorithm>
#include <cstddef>
#include <span>
#include <vector>

namespace brindle {

/// A range of a chord list.
struct CChordRange {
    CHarmAnlsChords::const_iterator mBegin;  ///< the first chord
    /// One behind the last chord.
    CHarmAnlsChords::const_iterator mEnd;

    friend bool operator==(const CChordRange&, const CChordRange&) = default;
};

/// For each range of one list of chords whether a longer one of them contains it. Equal ranges do
/// not contain each other.
[[nodiscard]] std::vector<bool> ContainedInLongerRange(std::span<const CChordRange> ranges);

/// Erases the elements whose mark is set. Returns whether there were any.
template <class List>
bool EraseMarked(List& list, const std::vector<bool>& marks) {
    std::size_t kept = 0;
    for (std::size_t place = 0; place < list.size(); ++place) {
        if (marks[place]) continue;
        if (kept != place) list[kept] = std::move(list[place]);
        ++kept;
    }
    if (kept == list.size()) return false;
    list.erase(list.begin() + static_cast<std::ptrdiff_t>(kept), list.end());
    return true;
}

}  // namespace brindle
