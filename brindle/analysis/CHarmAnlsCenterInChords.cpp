// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsCenterInChords.h"

#include "brindle/analysis/ChordRanges.h"
#include "brindle/analysis/ScaleLite.h"

#include <algorithm>
#include <iterator>

namespace brindle {

bool CHarmAnlsCenterInChords::IsSimultaneousWith(const CHarmAnlsCenterInChords& other) const {
    return mBegin == other.mBegin && mEnd == other.mEnd;
}

std::size_t CHarmAnlsCenterInChords::ChordsCount() const {
    return static_cast<std::size_t>(std::distance(mBegin, mEnd));
}

bool CHarmAnlsCenterInChords::IsLongerAndContains(const CHarmAnlsCenterInChords& other) const {
    return ChordsCount() > other.ChordsCount() && _IteratorInsideBeginAndEnd(other.mBegin) &&
           _IteratorInsideBeginAndEnd(other.mEnd);
}

bool CHarmAnlsCenterInChords::_IteratorInsideBeginAndEnd(chord_iterator it) const {
    return mBegin <= it && it <= mEnd;
}

void CHarmAnlsCenterInChords::ExtendForAdjacentDiatonicOrAllowedOutlierChords(
    const CHarmAnlsChords& chords) {
    if (chords.empty()) return;
    const CScaleLite scale = mCenter.ToScaleLite();
    while (mBegin > chords.begin() &&
           ScaleLite::ChordIsCompatibleWithScale(*std::prev(mBegin), scale)) {
        --mBegin;
    }
    while (mEnd < std::prev(chords.end()) && ScaleLite::ChordIsCompatibleWithScale(*mEnd, scale)) {
        ++mEnd;
    }
}

CHarmAnlsCenter CHarmAnlsCenterInChords::ToHarmAnlsCenter(const CHarmAnlsChords& chords) const {
    CHarmAnlsCenter center;
    if (mCenter.IsUndef() || mBegin == chords.end()) return center;
    center.mPosition = mBegin->mPosition;
    center.mHarmCenter = mCenter;
    center.mChords.assign(mBegin, mEnd);
    return center;
}

void CHarmAnlsCentersInChords::RemoveShorterContainedHarmCenters() {
    std::vector<CChordRange> ranges;
    ranges.reserve(size());
    for (const CHarmAnlsCenterInChords& center : *this) {
        ranges.push_back({center.mBegin, center.mEnd});
    }
    EraseMarked(*this, ContainedInLongerRange(ranges));
}

bool CHarmAnlsCentersInChords::HasLongerContainingHarmCenter(const_iterator it) const {
    return HasCenterThatIsLongerAndContains(*it);
}

bool CHarmAnlsCentersInChords::IsLongerAndContains(const CHarmAnlsCentersInChords& other) const {
    return std::any_of(other.begin(), other.end(), [&](const CHarmAnlsCenterInChords& center) {
        return HasCenterThatIsLongerAndContains(center);
    });
}

bool CHarmAnlsCentersInChords::HasCenterThatIsLongerAndContains(
    const CHarmAnlsCenterInChords& element) const {
    return std::any_of(begin(), end(), [&](const CHarmAnlsCenterInChords& center) {
        return center.IsLongerAndContains(element);
    });
}

CHarmAnlsCentersInChords::const_iterator CHarmAnlsCentersInChords::FindCenterMatching(
    const CHarmAnlsCenterInChords& center) const {
    return std::find_if(begin(), end(), [&](const CHarmAnlsCenterInChords& other) {
        return other.mCenter == center.mCenter;
    });
}

bool CHarmAnlsCentersInChords::ContainsSameCenterWithSameOrLongerChords(
    const CHarmAnlsCenterInChords& element) const {
    const auto same = FindCenterMatching(element);
    return same != end() && same->IsLongerAndContains(element);
}

std::pair<CHarmAnlsCentersInChords::chord_iterator, CHarmAnlsCentersInChords::chord_iterator>
CHarmAnlsCentersInChords::OverallBeginAndEndInputChord() const {
    if (empty()) return {};
    auto overall = std::pair(front().mBegin, front().mEnd);
    for (const CHarmAnlsCenterInChords& center : *this) {
        overall.first = std::min(overall.first, center.mBegin);
        overall.second = std::max(overall.second, center.mEnd);
    }
    return overall;
}

}  // namespace brindle
