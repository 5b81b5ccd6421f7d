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
struct CMatchedRange {
    std::size_t mFirst;
    std::size_t mNext;
};

/// Grows the range of a match at `at` within the chords from `begin` on.
CMatchedRange RangeOfMatch(const CHarmCenterLite& center, const CHarmAnlsChords& chords,
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

// What a walk goes through. Its center is the one that is looked for now; the walk asks
//   NextBestRow  for the next row that matches, from where the walk stands, and where it does;
//   Chords       for the chords, of which those from Begin on can belong to the center;
//   GiveRange    to give the center its chords. False when nothing is left to walk through;
//   GoOn         to make the next center ready;
//   Finish       for what is to be done when no row matches any more.

/// The last center of a sign key, and behind the chords that it has taken those that are left.
class CRemainder {
public:
    CRemainder(CHarmAnlsSignKey& signKey, const CHarmAnlsProgressions& progressions)
        : mSignKey(signKey),
          mCenters(signKey.mHarmCenters),
          mChords(std::move(mCenters.back().mChords)),
          mFinder(progressions, mChords) {
        mCenters.back().mChords.clear();
    }

    [[nodiscard]] const CHarmAnlsChords& Chords() const { return mChords; }
    [[nodiscard]] std::size_t Begin() const { return mBegin; }
    [[nodiscard]] CHarmAnlsCenter& Center() { return mCenters.back(); }
    const CHarmAnlsProgression* NextBestRow(std::size_t& at) {
        at = mBegin;
        return mFinder.NextBestRow(at);
    }
    /// What ChangeRangeOfHarmCenter does: the chords before the range go to the preceding center if
    /// the center was to reach that far, and those behind it are left for a new one.
    bool GiveRange(CMatchedRange range) {
        const double start = mChords[range.mFirst].mPosition;
        if (Center().mPosition < start) GiveToPreceding(range.mFirst);
        Center().mPosition = start;
        GiveChords(range.mNext);
        return mBegin < mChords.size();
    }
    void GoOn() {
        mCenters.push_back(UndefCenterAt(mChords[mBegin].mPosition));
        Center().IfUndefFillWithHarmSignKey(mSignKey);
    }
    void Finish() { GiveChords(mChords.size()); }

private:
    [[nodiscard]] CHarmAnlsChords::const_iterator At(std::size_t n) const {
        return mChords.begin() + static_cast<std::ptrdiff_t>(n);
    }
    void GiveChords(std::size_t end) {
        Center().mChords.assign(At(mBegin), At(end));
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

    CHarmAnlsSignKey& mSignKey;
    CHarmAnlsCenters& mCenters;
    CHarmAnlsChords mChords;
    CProgressionFinder mFinder;
    std::size_t mBegin = 0;
};

/// One center among others, which ChangeRangeOfHarmCenter keeps in order.
class COneCenter {
public:
    COneCenter(CHarmAnlsCenters& centers, std::size_t n, const CHarmAnlsProgressions& progressions)
        : mCenters(centers), mProgressions(progressions), mIndex(n) {}

    /// It can move.
    [[nodiscard]] std::size_t Index() const { return mIndex; }

    [[nodiscard]] const CHarmAnlsChords& Chords() const { return mCenters[mIndex].mChords; }
    [[nodiscard]] static std::size_t Begin() { return 0; }
    [[nodiscard]] CHarmAnlsCenter& Center() { return mCenters[mIndex]; }
    const CHarmAnlsProgression* NextBestRow(std::size_t& at) {
        at = mNext;
        return CProgressionFinder(mProgressions, Chords()).NextBestRow(at);
    }
    bool GiveRange(CMatchedRange range) {
        const auto center = mCenters.ChangeRangeOfHarmCenter(
            mCenters.begin() + static_cast<std::ptrdiff_t>(mIndex),
            Chords()[range.mFirst].mPosition, PositionAt(Chords(), range.mNext));
        mIndex = static_cast<std::size_t>(center - mCenters.begin());
        // Kept: the index counts from the front of the list as it was before the change.
        mNext = range.mNext;
        return true;
    }
    void GoOn() {}
    void Finish() {}

private:
    CHarmAnlsCenters& mCenters;
    const CHarmAnlsProgressions& mProgressions;
    std::size_t mIndex;
    std::size_t mNext = 0;
};

template <class Piece>
void Walk(CHarmAnlsSignKey& signKey, Piece& piece) {
    for (;;) {
        std::size_t at = 0;
        const CHarmAnlsProgression* row = piece.NextBestRow(at);
        if (row == nullptr) return piece.Finish();
        TakeScale(piece.Center(), *row, piece.Chords(), at);
        const bool hasMore = piece.GiveRange(
            RangeOfMatch(piece.Center().mHarmCenter, piece.Chords(), piece.Begin(), at));
        signKey.IfUndefFillWithHarmAnlsCenter(piece.Center());
        if (!hasMore) return;
        piece.GoOn();
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
        if (IsRemainder(centers, n)) {
            CRemainder remainder(signKey, mProgressions);
            return Walk(signKey, remainder);
        }
        COneCenter center(centers, n, mProgressions);
        Walk(signKey, center);
        n = center.Index();
    }
}

CHarmonicAnalyse::CFoundHarmCenter CHarmonicAnalyse::_FindHarmCenterViaTonicProgression(
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
