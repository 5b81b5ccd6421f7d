// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/CSuffixes.h"

namespace brindle {

/// All places where one passage of a list of symbols stands, its occurrences.
///
/// Two occurrences are partners when they do not overlap and the passage is all that they share:
/// they go on with different symbols, or the second begins where the first ends (a tandem).
class COccurrences {
public:
    /// `ranks` are those of the suffixes that begin with the passage.
    COccurrences(const CSuffixes& suffixes, CRanks ranks, TPlace length)
        : mSuffixes(&suffixes), mRanks(ranks), mLength(length) {}

    [[nodiscard]] TPlace Length() const { return mLength; }
    [[nodiscard]] bool Has(TPlace place) const {
        return place < mSuffixes->Count() && mRanks.Has(mSuffixes->RankOf(place));
    }
    /// The ranks of the occurrences that go on as this one does.
    [[nodiscard]] CRanks Continuation(TPlace place) const {
        return mSuffixes->RanksOfPassage(place, mLength + 1);
    }
    /// Whether the occurrence has a partner behind it.
    [[nodiscard]] bool HasPartner(TPlace place) const;

    // These find the first occurrence from `place` on; `kNoPlace` if there is none.

    [[nodiscard]] TPlace Next(TPlace place) const { return mSuffixes->NextPlace(mRanks, place); }
    /// That goes on otherwise.
    [[nodiscard]] TPlace NextContinuedOtherwise(TPlace place, CRanks continuation) const;
    /// That has a partner behind it.
    [[nodiscard]] TPlace NextWithPartner(TPlace place);
    /// That another occurrence follows at once. Remembers the last answer, so that places in
    /// ascending order ask for each occurrence once.
    [[nodiscard]] TPlace NextTandem(TPlace place);

private:
    [[nodiscard]] TPlace SearchTandem(TPlace place) const;
    [[nodiscard]] TPlace LastOfRow(TPlace place, TPlace period) const;
    [[nodiscard]] TPlace PlaceBehindFailedTandem(TPlace place, TPlace follower) const;

    const CSuffixes* mSuffixes;
    CRanks mRanks;
    TPlace mLength;
    // The next tandem from mAskedFrom on.
    TPlace mAskedFrom = kNoPlace;
    TPlace mTandem = 0;
};

}  // namespace brindle
