// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/CPassageStarts.h"

#include <algorithm>

namespace brindle {

std::vector<std::uint64_t> CPassageStarts::StartsOf(std::span<const CPassageForm> forms) {
    mStarts.clear();
    BeginWalks(forms);
    while (!mWalks.empty()) GoOn();
    for (const TPlace start : mStarts) mTaken.Erase(start);
    std::sort(mStarts.begin(), mStarts.end());
    return {mStarts.begin(), mStarts.end()};
}

void CPassageStarts::BeginWalks(std::span<const CPassageForm> forms) {
    mWalks.clear();
    for (const CPassageForm& form : forms) {
        CFormWalk walk{COccurrences(mSuffixes, form.mRanks, form.mLength)};
        walk.mNext = walk.mOccurrences.NextWithPartner(0);
        if (walk.mNext != kNoPlace) mWalks.push_back(walk);
    }
    std::make_heap(mWalks.begin(), mWalks.end(), ComesLater);
}

void CPassageStarts::GoOn() {
    std::pop_heap(mWalks.begin(), mWalks.end(), ComesLater);
    CFormWalk& walk = mWalks.back();
    const TPlace place = walk.mNext;
    // Another walk may have taken what this one was to take.
    if (walk.mStage != Stage_First && mWalks.size() > 1) FindNext(walk, place);
    if (walk.mNext == place) Visit(walk);
    if (walk.mNext == kNoPlace) {
        mWalks.pop_back();
    } else {
        std::push_heap(mWalks.begin(), mWalks.end(), ComesLater);
    }
}

void CPassageStarts::Visit(CFormWalk& walk) {
    const COccurrences& occurrences = walk.mOccurrences;
    const TPlace place = walk.mNext;
    const TPlace length = occurrences.Length();
    if (walk.mStage == Stage_First) {
        const CRanks continuation = occurrences.Continuation(place);
        TakePartners(occurrences, place, continuation);
        walk.mUnlike = occurrences.NextContinuedOtherwise(place + 1, continuation);
        walk.mStage = Stage_Tandems;
    } else if (place == walk.mUnlike) {
        TakePartners(occurrences, place, occurrences.Continuation(place));
        walk.mStage = Stage_Alone;
    } else if (walk.mStage == Stage_Tandems && occurrences.Has(place + length)) {
        TakeIfFree(place + length, length);
    }
    if (occurrences.HasPartner(place)) TakeIfFree(place, length);
    FindNext(walk, place + 1);
}

void CPassageStarts::FindNext(CFormWalk& walk, TPlace place) const {
    COccurrences& occurrences = walk.mOccurrences;
    walk.mNextAlone = NextToTakeItself(occurrences, std::max(place, walk.mNextAlone));
    walk.mNext = walk.mNextAlone;
    if (walk.mStage != Stage_Tandems) return;
    walk.mNextTandem = NextToTakeTandem(occurrences, std::max(place, walk.mNextTandem));
    walk.mNext = std::min({walk.mNext, walk.mUnlike, walk.mNextTandem});
}

TPlace CPassageStarts::NextToTakeItself(COccurrences& occurrences, TPlace place) const {
    for (TPlace next = occurrences.Next(place); next != kNoPlace;) {
        const TPlace free = FreeFrom(next, occurrences.Length());
        if (free == next) {
            const TPlace withPartner = occurrences.NextWithPartner(next);
            if (withPartner == next || withPartner == kNoPlace) return withPartner;
            next = withPartner;
        } else {
            next = occurrences.Next(free);
        }
    }
    return kNoPlace;
}

TPlace CPassageStarts::NextToTakeTandem(COccurrences& occurrences, TPlace place) const {
    const TPlace length = occurrences.Length();
    for (TPlace next = occurrences.NextTandem(place); next != kNoPlace;) {
        const TPlace free = FreeFrom(next + length, length);
        if (free == next + length) return next;
        next = occurrences.NextTandem(std::max(next + 1, free - length));
    }
    return kNoPlace;
}

void CPassageStarts::TakePartners(const COccurrences& occurrences, TPlace place,
                                  CRanks continuation) {
    const TPlace length = occurrences.Length();
    if (occurrences.Has(place + length)) TakeIfFree(place + length, length);
    TPlace next = occurrences.NextContinuedOtherwise(place + length, continuation);
    while (next != kNoPlace) {
        TakeIfFree(next, length);
        next = occurrences.NextContinuedOtherwise(FreeFrom(next, length), continuation);
    }
}

void CPassageStarts::TakeIfFree(TPlace place, TPlace length) {
    if (FreeFrom(place, length) != place) return;
    mTaken.Insert(place);
    mStarts.push_back(place);
}

TPlace CPassageStarts::FreeFrom(TPlace place, TPlace length) const {
    const TPlace taken = mTaken.LastUpTo(place);
    return taken == kNoPlace || place - taken >= length ? place : taken + length;
}

}  // namespace brindle
