// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/CCopyFinder.h"

#include <algorithm>
#include <limits>
#include <numeric>

namespace brindle {

namespace {

std::int32_t AddLimited(std::int32_t a, std::int32_t b) {
    using TLimits = std::numeric_limits<std::int32_t>;
    return static_cast<std::int32_t>(
        std::clamp<std::int64_t>(std::int64_t{a} + b, TLimits::min(), TLimits::max()));
}

}  // namespace

CCopyFinder::CCopyFinder(const CHarmAnlsChordsWithLength& chords,
                         const THarmRepeatingSequences& sequences, std::uint64_t start)
    : mChords(chords),
      mSequences(sequences),
      mLengths(chords),
      mCovered(chords.size()),
      mFirstAtPlace(chords.size() + 2, 0) {
    const std::uint64_t count = chords.size();
    for (std::size_t sequence = 0; sequence < sequences.size(); ++sequence) {
        const auto& [starts, length] = sequences[sequence];
        if (length == 0 || length > count / 2) continue;
        for (const std::uint64_t at : starts) {
            if (at < start || at - start > count - length) continue;
            mStarts.push_back({static_cast<TPlace>(sequence), static_cast<TPlace>(at - start)});
        }
    }
    if (!std::is_sorted(mStarts.begin(), mStarts.end(), ComesFirst)) {
        std::sort(mStarts.begin(), mStarts.end(), ComesFirst);
    }
    // Counted one place higher, so that filling leaves the begin of each place.
    for (const CStart& at : mStarts) ++mFirstAtPlace[at.mPlace + 2];
    std::partial_sum(mFirstAtPlace.begin(), mFirstAtPlace.end(), mFirstAtPlace.begin());
    mSequencesByPlace.resize(mStarts.size());
    for (const CStart& at : mStarts) {
        mSequencesByPlace[mFirstAtPlace[at.mPlace + 1]++] = at.mSequence;
    }
}

void CCopyFinder::AppendCopies(std::int32_t position, std::vector<CCopiedPassage>& copies) {
    Fill(0, static_cast<TPlace>(mChords.size()), position, mStarts, copies);
}

void CCopyFinder::Fill(TPlace first, TPlace end, std::int32_t position, const TStarts& starts,
                       std::vector<CCopiedPassage>& copies) {
    std::vector<std::int32_t> beatsTo;
    TStarts free;
    for (auto next = starts.begin(); next != starts.end();) {
        const TPlace sequence = next->mSequence;
        free.clear();
        for (; next != starts.end() && next->mSequence == sequence; ++next) {
            if (IsFree(*next)) free.push_back(*next);
        }
        if (free.size() < 2) continue;
        if (beatsTo.empty()) mLengths.WholeBeatsTo(beatsTo, first, end);
        FillFromSequence(free, first, beatsTo, position, copies);
    }
}

void CCopyFinder::FillFromSequence(const TStarts& places, TPlace first,
                                   const std::vector<std::int32_t>& beatsTo, std::int32_t position,
                                   std::vector<CCopiedPassage>& copies) {
    const TPlace source = places.front().mPlace;
    const TPlace length = LengthOf(places.front().mSequence);
    for (const CStart& start : places) {
        const TPlace place = start.mPlace;
        const std::int32_t target = AddLimited(position, beatsTo[place - first]);
        if (&start == &places.front()) {
            FillFromSource(source, length, target, copies);
        } else {
            const CHarmCopy copy{static_cast<double>(target), mLengths.BarsBack(source, place),
                                 mLengths.Bars(place, place + length), 0};
            copies.push_back({copy, source, place, length});
        }
        Cover(start);
    }
}

// The chords of the source are still free, and are covered as soon as this returns.
void CCopyFinder::FillFromSource(TPlace source, TPlace length, std::int32_t position,
                                 std::vector<CCopiedPassage>& copies) {
    TStarts starts;
    for (TPlace place = source; place < source + length; ++place) {
        for (std::size_t n = mFirstAtPlace[place]; n < mFirstAtPlace[place + 1]; ++n) {
            const TPlace sequence = mSequencesByPlace[n];
            const TPlace itsLength = LengthOf(sequence);
            if (itsLength <= length / 2 && place + itsLength <= source + length) {
                starts.push_back({sequence, place});
            }
        }
    }
    std::sort(starts.begin(), starts.end(), ComesFirst);
    Fill(source, source + length, position, starts, copies);
}

TPlace CCopyFinder::LengthOf(TPlace sequence) const {
    return static_cast<TPlace>(mSequences[sequence].second);
}

bool CCopyFinder::IsFree(const CStart& start) const {
    const TPlace last = start.mPlace + LengthOf(start.mSequence) - 1;
    const TPlace covered = mCovered.LastUpTo(last);
    return covered == kNoPlace || covered < start.mPlace;
}

void CCopyFinder::Cover(const CStart& start) {
    const TPlace end = start.mPlace + LengthOf(start.mSequence);
    for (TPlace place = start.mPlace; place < end; ++place) mCovered.Insert(place);
}

}  // namespace brindle
