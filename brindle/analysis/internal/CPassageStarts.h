// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/COccurrences.h"
#include "brindle/analysis/internal/RepeatedPassages.h"

#include <cstdint>
#include <span>
#include <vector>

namespace brindle {

/// Chooses the starts of a repeated passage among its occurrences.
///
/// By definition every occurrence, from left to right, takes its partners from left to right and
/// then itself; a start is taken unless it lies inside a passage that was taken before it.
///
/// Most of these steps take nothing, and they are passed over. Call two occurrences alike if they
/// go on with the same symbol. Behind the first occurrence with a partner nothing is free that is
/// not like it, so until the first one unlike it only tandems are left to be taken, and behind that
/// one nothing is free at all. From then on each occurrence can only take itself. What is left
/// costs a few searches for each start, of which there are at most 3 in the length of a passage.
///
///     symbols   a b x  a b x  a b y  a b x      the passage is "a b"
///     place     0      3      6      9
///
/// Place 0 is the first: it goes on with x, so that its partner is the one with y. It takes 6, and
/// then itself. 6 is the first unlike it; before that, 3 is no tandem but has the partner 6, and
/// takes itself. 6 takes its partner 9, and nothing is left for 9.
class CPassageStarts {
public:
    explicit CPassageStarts(const CSuffixes& suffixes)
        : mSuffixes(suffixes), mTaken(suffixes.Count()) {}

    /// The starts of a group of forms in ascending order; none if no form has partners.
    [[nodiscard]] std::vector<std::uint64_t> StartsOf(std::span<const CPassageForm> forms);

private:
    enum TStage { Stage_First, Stage_Tandems, Stage_Alone };

    /// The way over the occurrences of one form.
    struct CFormWalk {
        COccurrences mOccurrences;
        TStage mStage = Stage_First;
        TPlace mNext = kNoPlace;
        /// Nothing that is to be taken stands before these: what is not free stays so.
        TPlace mNextAlone = 0;
        TPlace mNextTandem = 0;
        /// The first occurrence unlike the first with a partner.
        TPlace mUnlike = kNoPlace;
    };

    static bool ComesLater(const CFormWalk& a, const CFormWalk& b) { return a.mNext > b.mNext; }

    void BeginWalks(std::span<const CPassageForm> forms);
    /// A step of the walk whose next occurrence stands before those of all others.
    void GoOn();
    void Visit(CFormWalk& walk);
    void FindNext(CFormWalk& walk, TPlace place) const;
    [[nodiscard]] TPlace NextToTakeItself(COccurrences& occurrences, TPlace place) const;
    [[nodiscard]] TPlace NextToTakeTandem(COccurrences& occurrences, TPlace place) const;
    void TakePartners(const COccurrences& occurrences, TPlace place, CRanks continuation);
    void TakeIfFree(TPlace place, TPlace length);
    /// The end of the passage that was taken over a place; the place itself if it is free.
    [[nodiscard]] TPlace FreeFrom(TPlace place, TPlace length) const;

    const CSuffixes& mSuffixes;
    CPlaceSet mTaken;
    std::vector<TPlace> mStarts;
    std::vector<CFormWalk> mWalks;  // a heap, the next to visit on top
};

}  // namespace brindle
