// SPDX-License-Identifier: MIT
#include "brindle/analysis/ChordRanges.h"

namespace brindle {

// By begin, and among ranges with the same begin the longest first, every range that contains
// another comes before it. So a range is contained in a longer one exactly if one of the
// different ranges before it ends where it ends or later, and the latest end so far tells that.

std::vector<bool> ContainedInLongerRange(std::span<const CChordRange> ranges) {
    struct CPlacedRange : CChordRange {
        std::size_t mPlace;
    };
    std::vector<CPlacedRange> sorted;
    sorted.reserve(ranges.size());
    for (std::size_t place = 0; place < ranges.size(); ++place) {
        sorted.push_back({ranges[place], place});
    }
    std::sort(sorted.begin(), sorted.end(), [](const CPlacedRange& a, const CPlacedRange& b) {
        return a.mBegin != b.mBegin ? a.mBegin < b.mBegin : a.mEnd > b.mEnd;
    });

    std::vector<bool> isContained(ranges.size());
    auto latestEnd = CHarmAnlsChords::const_iterator{};
    for (std::size_t n = 0; n < sorted.size(); ++n) {
        const CPlacedRange& range = sorted[n];
        const bool isFirst = n == 0;
        if (!isFirst && range == sorted[n - 1]) {
            isContained[range.mPlace] = isContained[sorted[n - 1].mPlace];
            continue;
        }
        isContained[range.mPlace] = !isFirst && latestEnd >= range.mEnd;
        if (isFirst || latestEnd < range.mEnd) latestEnd = range.mEnd;
    }
    return isContained;
}

}  // namespace brindle
