// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/analysis/ProgressionFinder.h"
#include "brindle/analysis/RouteRanges.h"

#include <algorithm>
#include <cstddef>

namespace brindle {

namespace {

/// The center that the first chord of a cadence tells, with flats on all black keys.
CHarmCenterLite CenterFromFirstChord(const CHarmAnlsProgression& row, const CHarmAnlsChord& chord) {
    constexpr unsigned kBlackKeys = 1u << 1 | 1u << 3 | 1u << 6 | 1u << 8 | 1u << 10;
    const auto distance =
        (std::int64_t{chord.mRootKeyEnh.mKeyNr} - std::int64_t{row.front().mRootDistToHarmCenter}) %
        12;
    const int key = static_cast<int>(distance < 0 ? distance + 12 : distance);
    const bool isBlack = (kBlackKeys >> key & 1) != 0;
    return {{key, isBlack ? TEnh_b : TEnh_n}, SemitonesFromSignKeyType(row.mSignKeyType)};
}

/// Only undefined chords in front are passed over; behind a first real chord also a chord without
/// a root can begin a match.
std::size_t FirstRealChord(const CHarmAnlsChords& chords) {
    const auto first = std::find_if(chords.begin(), chords.end(),
                                    [](const CHarmAnlsChord& chord) { return !chord.IsUndef(); });
    return static_cast<std::size_t>(first - chords.begin());
}

/// The first cadence decides the center, which then reaches to the end of the piece. Returns the
/// iterator to the same center.
CHarmAnlsCenters::iterator TakeFirstCadence(CHarmAnlsSignKey& signKey,
                                            CHarmAnlsCenters::iterator center,
                                            const CHarmAnlsProgressions& progressions) {
    const CHarmAnlsChords& chords = center->mChords;
    std::size_t at = FirstRealChord(chords);
    const CHarmAnlsProgression* row = CProgressionFinder(progressions, chords).NextBestRow(at);
    if (row == nullptr) return center;
    auto first = chords.begin() + static_cast<std::ptrdiff_t>(at);
    center->mHarmCenter = CenterFromFirstChord(*row, *first);
    if (center->mPosition == kPosUndef) center->mPosition = first->mPosition;
    RouteRanges::MoveToFirstTolerated(center->mHarmCenter, chords.begin(), first);
    center = signKey.mHarmCenters.ChangeRangeOfHarmCenter(center, first->mPosition, kPosEnd);
    signKey.IfUndefFillWithHarmAnlsCenter(*center);
    return center;
}

}  // namespace

void CHarmonicAnalyse::_FindAndInsertHarmCentersUsingCadenceProgressions(
    TOnlyUndefCenters onlyUndef) {
    for (CHarmAnlsSignKey& signKey : mSignKeys) {
        _FindAndInsertHarmCentersUsingCadenceProgression_ForSignKey(signKey, onlyUndef);
    }
}

void CHarmonicAnalyse::_FindAndInsertHarmCentersUsingCadenceProgression_ForSignKey(
    CHarmAnlsSignKey& signKey, TOnlyUndefCenters onlyUndef) {
    CHarmAnlsCenters& centers = signKey.mHarmCenters;
    for (auto center = centers.begin(); center != centers.end(); ++center) {
        if (onlyUndef == TOnlyUndefCenters_Yes && !center->IsUndef()) continue;
        center->IfUndefFillWithHarmSignKey(signKey);
        center = TakeFirstCadence(signKey, center, mProgressions);
    }
}

}  // namespace brindle
