// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/COccurrences.h"

#include <algorithm>

namespace brindle {

TPlace COccurrences::NextContinuedOtherwise(TPlace place, CRanks continuation) const {
    return std::min(mSuffixes->NextPlace({mRanks.mFirst, continuation.mFirst}, place),
                    mSuffixes->NextPlace({continuation.mEnd, mRanks.mEnd}, place));
}

bool COccurrences::HasPartner(TPlace place) const {
    return Has(place + mLength) ||
           NextContinuedOtherwise(place + mLength, Continuation(place)) != kNoPlace;
}

TPlace COccurrences::NextWithPartner(TPlace place) {
    TPlace next = Next(place);
    while (next != kNoPlace && Next(next + mLength) != kNoPlace) {
        if (HasPartner(next)) return next;
        // All that follow go on as this one does: only another kind, or a tandem, has a partner.
        next = std::min(NextContinuedOtherwise(next + 1, Continuation(next)), NextTandem(next + 1));
    }
    return kNoPlace;
}

TPlace COccurrences::NextTandem(TPlace place) {
    if (place < mAskedFrom || place > mTandem) {
        mAskedFrom = place;
        mTandem = SearchTandem(place);
    }
    return mTandem;
}

TPlace COccurrences::SearchTandem(TPlace place) const {
    TPlace next = Next(place);
    while (next != kNoPlace) {
        const TPlace follower = Next(next + mLength);
        if (follower == kNoPlace) return kNoPlace;
        if (follower == next + mLength) return next;
        next = Next(PlaceBehindFailedTandem(next, follower));
    }
    return kNoPlace;
}

// Where occurrences overlap by half or more, the passage repeats itself with a period, and its
// occurrences stand in rows, a period apart. `follower` is the first occurrence behind `place`
// that does not overlap it, and does not follow it at once. To try one occurrence of a row after
// the other would make the search quadratic in lists that repeat a few chords all the time, so
// whole rows are passed over.
//
//   symbols  a b a b a b a b a c a b a b a     the passage is "a b a b a", its period 2
//   places   0   2   4         10              two rows, 0 2 4 and 10
//
// A tandem would be two places 5 apart. From place 0 on the next one without overlap is 10, the
// first of its row: no occurrence before 5 has one directly behind it, and the search goes on
// there. In one row alone, 0 2 4 6, all distances are even and none is 5.
TPlace COccurrences::PlaceBehindFailedTandem(TPlace place, TPlace follower) const {
    const TPlace period = Next(place + 1) - place;
    if (2 * period > mLength) return follower - mLength;
    const TPlace last = LastOfRow(place, period);
    if (follower <= last) {
        // The period does not divide the length: no two of this row are a tandem.
        const TPlace nextRow = Next(last + 1);
        return nextRow == kNoPlace ? kNoPlace : nextRow - mLength;
    }
    const bool isFirstOfRow = follower - period <= last || !Has(follower - period);
    if (isFirstOfRow) return follower - mLength;
    // The two rows are out of step, and no two of them are a tandem.
    return std::min(last, LastOfRow(follower, period) - mLength) + 1;
}

TPlace COccurrences::LastOfRow(TPlace place, TPlace period) const {
    if (place + period >= mSuffixes->Count()) return place;
    const TPlace periodic = period + mSuffixes->EqualCount(place, place + period);
    if (periodic < mLength) return place;
    return place + (periodic - mLength) / period * period;
}

}  // namespace brindle
