// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlTranspose.h"

#include <cstddef>
#include <utility>
#include <vector>

namespace brindle {

/// How many notes of a part stood under each transposition.
///
/// A list in the order of transpositions. As that order is none where octaves and doublings mix, it
/// is no map: a place is looked up by halving the list, and what was there first stays.
class CTransposeNoteCounts {
public:
    using TEntry = std::pair<CMuxmlTranspose, std::int32_t>;  ///< a transposition and its notes

    /// Adds to the count of the transposition; 0 only makes an entry for it. Beyond
    /// kMuxmlMaxTransposes no entries are made.
    void Add(const CMuxmlTranspose& transpose, std::int32_t noteCount);

    /// The first transposition with the largest count; the default one when there is none.
    [[nodiscard]] CMuxmlTranspose TransposeWithMostNotes() const;

    /// The entries, mostly ascending; valid until the next Add.
    [[nodiscard]] std::vector<TEntry>::const_iterator begin() const { return mEntries.begin(); }
    /// Behind the last of them.
    [[nodiscard]] std::vector<TEntry>::const_iterator end() const { return mEntries.end(); }
    /// Different transpositions, kMuxmlMaxTransposes at most.
    [[nodiscard]] std::size_t size() const { return mEntries.size(); }

private:
    std::vector<TEntry> mEntries;
};

}  // namespace brindle
