// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/CPlaceSet.h"

#include <cstddef>
#include <vector>

namespace brindle {

/// A range of ranks in a sorted list, the end not included.
struct CRanks {
    TPlace mFirst = 0;
    TPlace mEnd = 0;

    [[nodiscard]] bool Has(TPlace rank) const { return rank >= mFirst && rank < mEnd; }
    [[nodiscard]] TPlace size() const { return mEnd - mFirst; }
};

/// All suffixes of a list of symbols in sorted order: a suffix array, with what neighbours share
/// (the LCP array, the lengths of their longest common prefixes) and a wavelet matrix of the
/// places, which finds the next occurrence of a passage without looking at all of them. The
/// suffixes that begin with the same symbols stand side by side, so that any passage of the list is
/// a range of ranks, and the range holds all its occurrences.
///
/// Built by doubling: the order by the first 2k symbols comes from that by the first k. Takes
/// n log n steps and room; each question takes at most log n steps.
class CSuffixes {
public:
    /// The symbols are numbers below the length of the list.
    explicit CSuffixes(const std::vector<TPlace>& symbols);

    [[nodiscard]] TPlace Count() const { return static_cast<TPlace>(mPlaceOfRank.size()); }
    [[nodiscard]] TPlace PlaceOf(TPlace rank) const { return mPlaceOfRank[rank]; }
    [[nodiscard]] TPlace RankOf(TPlace place) const { return mRankOfPlace[place]; }
    /// How many symbols the suffix of a rank shares with the one before it; 0 for rank 0.
    [[nodiscard]] TPlace SharedWithPrevious(TPlace rank) const { return mShared.front()[rank]; }

    /// How many symbols are equal from two places on.
    [[nodiscard]] TPlace EqualCount(TPlace a, TPlace b) const;
    /// The suffixes that share their first `count` symbols with the one at a place.
    [[nodiscard]] CRanks RanksOfPassage(TPlace place, TPlace count) const;
    /// The first place from `place` on whose suffix has one of the ranks; `kNoPlace` without one.
    [[nodiscard]] TPlace NextPlace(CRanks ranks, TPlace place) const;

private:
    /// By prefix doubling.
    void SortSuffixes(const std::vector<TPlace>& symbols);
    /// Fills the LCP array in one walk over the places.
    void CompareNeighbours(const std::vector<TPlace>& symbols);
    void MakeMinima();
    void SplitByBits();
    [[nodiscard]] TPlace SmallestPlace(std::size_t level, CRanks ranks) const;
    [[nodiscard]] CRanks Zeros(std::size_t level, CRanks ranks) const;
    [[nodiscard]] CRanks Ones(std::size_t level, CRanks ranks) const;

    std::vector<TPlace> mPlaceOfRank;
    std::vector<TPlace> mRankOfPlace;
    // The LCP array, and behind it row k: the least of 2^k of its entries from a rank on (a sparse
    // table of range minima).
    std::vector<std::vector<TPlace>> mShared;
    // The wavelet matrix. Row k: the places split stably by their bits, the highest first; how many
    // of the first so many have a 0. The last entry is the number of all that have.
    std::vector<std::vector<TPlace>> mZerosBefore;
};

}  // namespace brindle
