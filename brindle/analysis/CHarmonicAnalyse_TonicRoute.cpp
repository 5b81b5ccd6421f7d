// SPDX-License-Identifier: MIT
#include "brindle/analysis/CAnalyseHarmCenterAlternatives.h"
#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/analysis/ProgressionFinder.h"
#include "brindle/analysis/RouteRanges.h"

#include <algorithm>
#include <cstddef>
#include <utility>

namespace brindle {

// The walk gives each found center the chords around its match and moves the chords behind them
// into a new center, where it goes on. Moved each time, the rest of a piece that changes its key
// every few chords would cost the square of its length. So once the walk stands in the last center
// and all positions rise, the rest stays where it is as one list, the remainder, and each found
// center takes its chords off the front. Elsewhere, in centers that the caller gave and with
// positions that do not rise, ChangeRangeOfHarmCenter does the work step by step.

namespace {

/// The range that a match gives its center: chord indexes, `mNext` is behind the last one.
struct TMatchedRange {
    std::size_t mFirst;
    std::size_t mNext;
};

/// Grows the range of a match at `at` within the chords from `begin` on.
TMatchedRange RangeOfMatch(const CHarmCenterLite& center, const CHarmAnlsChords& chords,
                           std::size_t begin, std::size_t at) {
    const auto listBegin = chords.begin() + static_cast<std::ptrdiff_t>(begin);
    auto first = chords.begin() + static_cast<std::ptrdiff_t>(at);
    auto last = first;
    RouteRanges::MoveToFirstTolerated(center, listBegin, first);
    RouteRanges::MoveToLastTolerated(center, chords.end(), last);
    return {static_cast<std::size_t>(first - chords.begin()),
            static_cast<std::size_t>(last - chords.begin()) + 1};
}

/// Gives the center the scale of the row that matches at `at`, and a position if it has none.
void TakeScale(CHarmAnlsCenter& center, const CHarmAnlsProgression& row,
               const CHarmAnlsChords& chords, std::size_t at) {
    const auto it = chords.begin() + static_cast<std::ptrdiff_t>(at);
    center.mHarmCenter = row.HarmCenterCalculatedFromFoundProgressionLastChord(it, chords);
    if (center.mPosition == kPosUndef) center.mPosition = it->mPosition;
}

double PositionAt(const CHarmAnlsChords& chords, std::size_t at) {
    return at < chords.size() ? chords[at].mPosition : kPosEnd;
}

bool PositionsRise(const CHarmAnlsChords& chords) {
    const auto doesNotRise = [](const CHarmAnlsChordWithPos& a, const CHarmAnlsChordWithPos& b) {
        return !(a.mPosition < b.mPosition);
    };
    return std::adjacent_find(chords.begin(), chords.end(), doesNotRise) == chords.end() &&
           chords.front().mPosition > kPosUndef && chords.back().mPosition < kPosEnd;
}

bool AllChordsStartBefore(const CHarmAnlsCenters& centers, std::size_t count, double position) {
    return std::all_of(centers.begin(), centers.begin() + static_cast<std::ptrdiff_t>(count),
                       [position](const CHarmAnlsCenter& center) {
                           return std::all_of(center.mChords.begin(), center.mChords.end(),
                                              [position](const CHarmAnlsChordWithPos& chord) {
                                                  return chord.mPosition < position;
                                              });
                       });
}

/// Whether a change of range in this center concerns no chords but its own and those behind them.
bool IsRemainder(const CHarmAnlsCenters& centers, std::size_t n) {
    const CHarmAnlsCenter& center = centers[n];
    if (n + 1 != centers.size() || center.mChords.empty() || !PositionsRise(center.mChords)) {
        return false;
    }
    const double firstPosition = center.mChords.front().mPosition;
    if (center.mPosition == kPosUndef) return AllChordsStartBefore(centers, n, firstPosition);
    return center.mPosition <= firstPosition && AllChordsStartBefore(centers, n, center.mPosition);
}

CHarmAnlsCenter UndefCenterAt(double position) {
    CHarmAnlsCenter center;
    center.mPosition = position;
    return center;
}

/// The last center of a sign key, and behind the chords that it has taken those that are left.
class CRemainder {
public:
    explicit CRemainder(CHarmAnlsCenters& centers)
        : mCenters(centers), mChords(std::move(centers.back().mChords)) {
        centers.back().mChords.clear();
    }

    [[nodiscard]] const CHarmAnlsChords& Chords() const { return mChords; }
    [[nodiscard]] std::size_t Begin() const { return mBegin; }

    /// What ChangeRangeOfHarmCenter does: the chords before the range go to the preceding center if
    /// the center was to reach that far, and those behind it are left for a new one. Returns
    /// whether there are any.
    bool GiveRange(TMatchedRange range) {
        const double start = mChords[range.mFirst].mPosition;
        if (mCenters.back().mPosition < start) GiveToPreceding(range.mFirst);
        mCenters.back().mPosition = start;
        GiveChords(range.mNext);
        return mBegin < mChords.size();
    }
    void AppendCenter() { mCenters.push_back(UndefCenterAt(mChords[mBegin].mPosition)); }
    void GiveAllChords() { GiveChords(mChords.size()); }

private:
    [[nodiscard]] CHarmAnlsChords::const_iterator At(std::size_t n) const {
        return mChords.begin() + static_cast<std::ptrdiff_t>(n);
    }
    void GiveChords(std::size_t end) {
        mCenters.back().mChords.assign(At(mBegin), At(end));
        mBegin = end;
    }
    void GiveToPreceding(std::size_t first) {
        // Kept: an undefined chord at the border belongs to what ends there.
        const std::size_t end = mChords[first].IsUndef() ? first + 1 : first;
        if (end == mBegin) return;
        if (mCenters.size() == 1) {
            mCenters.insert(mCenters.begin(), UndefCenterAt(mChords[mBegin].mPosition));
        }
        CHarmAnlsCenter& preceding = mCenters[mCenters.size() - 2];
        preceding.mChords.InsertAtCorrectPosition(At(mBegin), At(end));
        mBegin = end;
    }

    CHarmAnlsCenters& mCenters;
    CHarmAnlsChords mChords;
    std::size_t mBegin = 0;
};

/// The walk through the last center and all that split off behind it.
void WalkRemainder(CHarmAnlsSignKey& signKey, const CHarmAnlsProgressions& progressions) {
    CHarmAnlsCenters& centers = signKey.mHarmCenters;
    CRemainder remainder(centers);
    CProgressionFinder finder(progressions, remainder.Chords());
    for (;;) {
        std::size_t at = remainder.Begin();
        const CHarmAnlsProgression* row = finder.NextBestRow(at);
        if (row == nullptr) return remainder.GiveAllChords();
        TakeScale(centers.back(), *row, remainder.Chords(), at);
        const bool hasMore = remainder.GiveRange(
            RangeOfMatch(centers.back().mHarmCenter, remainder.Chords(), remainder.Begin(), at));
        signKey.IfUndefFillWithHarmAnlsCenter(centers.back());
        if (!hasMore) return;
        remainder.AppendCenter();
        centers.back().IfUndefFillWithHarmSignKey(signKey);
    }
}

/// The walk through one center. Returns its index, which can have moved.
std::size_t WalkCenter(CHarmAnlsSignKey& signKey, std::size_t n,
                       const CHarmAnlsProgressions& progressions) {
    CHarmAnlsCenters& centers = signKey.mHarmCenters;
    std::size_t at = 0;
    for (;;) {
        const CHarmAnlsChords& chords = centers[n].mChords;
        const CHarmAnlsProgression* row = CProgressionFinder(progressions, chords).NextBestRow(at);
        if (row == nullptr) return n;
        TakeScale(centers[n], *row, chords, at);
        const TMatchedRange range = RangeOfMatch(centers[n].mHarmCenter, chords, 0, at);
        const auto center = centers.ChangeRangeOfHarmCenter(
            centers.begin() + static_cast<std::ptrdiff_t>(n), chords[range.mFirst].mPosition,
            PositionAt(chords, range.mNext));
        n = static_cast<std::size_t>(center - centers.begin());
        // Kept: the index counts from the front of the list as it was before the change.
        at = range.mNext;
        signKey.IfUndefFillWithHarmAnlsCenter(*center);
    }
}

/// As many centers as a walk can come to: each one that it adds takes at least a chord from the
/// one before. Only chords out of order, such as many at one position, could go round for ever.
std::size_t MostCenters(const CHarmAnlsCenters& centers) {
    std::size_t most = centers.size() + 1;
    for (const CHarmAnlsCenter& center : centers) most += center.mChords.size();
    return most;
}

}  // namespace

void CHarmonicAnalyse::_FindAndInsertHarmCentersUsingTonicProgressions(
    TOnlyUndefCenters onlyUndef) {
    if (mSignKeys.empty()) return;
    CHarmAnlsCenters found = CAnalyseHarmCenterAlternatives(mChords).BestResults();
    if (found.empty()) {
        for (CHarmAnlsSignKey& signKey : mSignKeys) {
            _FindAndInsertHarmCenterUsingTonicProgressions_ForSignKey(signKey, onlyUndef);
        }
        return;
    }
    CHarmAnlsSignKey& first = mSignKeys.front();
    first.mHarmCenters = std::move(found);
    first.IfUndefFillWithHarmAnlsCenter(first.mHarmCenters.front());
}

void CHarmonicAnalyse::_FindAndInsertHarmCenterUsingTonicProgressions_ForSignKey(
    CHarmAnlsSignKey& signKey, TOnlyUndefCenters onlyUndef) {
    CHarmAnlsCenters& centers = signKey.mHarmCenters;
    const std::size_t mostCenters = MostCenters(centers);
    for (std::size_t n = 0; n < std::min(centers.size(), mostCenters); ++n) {
        if (onlyUndef == TOnlyUndefCenters_Yes && !centers[n].IsUndef()) continue;
        centers[n].IfUndefFillWithHarmSignKey(signKey);
        if (IsRemainder(centers, n)) return WalkRemainder(signKey, mProgressions);
        n = WalkCenter(signKey, n, mProgressions);
    }
}

CHarmonicAnalyse::TFoundHarmCenter CHarmonicAnalyse::_FindHarmCenterViaTonicProgression(
    CHarmAnlsChords::const_iterator chord, const CHarmAnlsChords& chords,
    const CHarmAnlsSignKey& /*signKey*/) const {
    const auto matches = mProgressions.FindAndSortForwardMatchingProgressions(chord, chords);
    if (matches.empty()) return {false, CHarmCenterLite_Undef, chords.end()};
    return {true, matches.front().HarmCenterCalculatedFromFoundProgressionLastChord(chord, chords),
            chord};
}

void CHarmonicAnalyse::_ExtendRangeOfHarmCenter(const CHarmCenterLite& center,
                                                const CHarmAnlsChords& chords,
                                                CHarmAnlsChords::const_iterator& first,
                                                CHarmAnlsChords::const_iterator& last) const {
    RouteRanges::MoveToFirstTolerated(center, chords.begin(), first);
    RouteRanges::MoveToLastTolerated(center, chords.end(), last);
    if (last != chords.end()) ++last;
}

}  // namespace brindle
