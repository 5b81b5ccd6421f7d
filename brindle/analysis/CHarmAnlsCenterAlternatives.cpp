// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsCenterAlternatives.h"

#include "brindle/analysis/ChordRanges.h"

#include <algorithm>
#include <cstddef>
#include <span>

namespace brindle {

// By their meaning all operations here compare each reading with each other one. They are worked
// out by sorting: readings that concern each other then stand side by side, and inside such a group
// they keep the order of the list, so that probabilities are added in that order.

namespace {

/// A reading with what the groups are formed by, so that sorting stays within one block of memory.
struct CReading {
    const CHarmAnlsCentersInChords* mCenters;
    CChordRange mOverall;
    std::size_t mPlace;

    [[nodiscard]] bool HasAtMostOneCenter() const { return mCenters->size() <= 1; }
};

bool LessByRange(const CHarmAnlsCenterInChords& a, const CHarmAnlsCenterInChords& b) {
    return a.mBegin != b.mBegin ? a.mBegin < b.mBegin : a.mEnd < b.mEnd;
}

bool LessByRangeAndCenter(const CHarmAnlsCenterInChords& a, const CHarmAnlsCenterInChords& b) {
    return a.IsSimultaneousWith(b) ? a.mCenter < b.mCenter : LessByRange(a, b);
}

/// Readings without centers go first and all have the same overall range.
bool LessByOverallRange(const CReading& a, const CReading& b) {
    if (a.mCenters->empty() || b.mCenters->empty()) {
        return a.mCenters->empty() && !b.mCenters->empty();
    }
    if (a.mOverall.mBegin != b.mOverall.mBegin) return a.mOverall.mBegin < b.mOverall.mBegin;
    return a.mOverall.mEnd < b.mOverall.mEnd;
}

bool LessByRanges(const CReading& a, const CReading& b) {
    if (a.HasAtMostOneCenter() && b.HasAtMostOneCenter()) return LessByOverallRange(a, b);
    return std::lexicographical_compare(a.mCenters->begin(), a.mCenters->end(), b.mCenters->begin(),
                                        b.mCenters->end(), LessByRange);
}

bool LessByCenters(const CReading& a, const CReading& b) {
    return std::lexicographical_compare(a.mCenters->begin(), a.mCenters->end(), b.mCenters->begin(),
                                        b.mCenters->end(), LessByRangeAndCenter);
}

std::vector<CReading> ReadingsOf(const CHarmAnlsCenterAlternatives& alternatives) {
    std::vector<CReading> readings;
    readings.reserve(alternatives.size());
    for (const CHarmAnlsCenterAlternative& alternative : alternatives) {
        const auto [begin, end] = alternative.mCenters.OverallBeginAndEndInputChord();
        readings.push_back({&alternative.mCenters, {begin, end}, readings.size()});
    }
    return readings;
}

/// Hands each group of readings that are equal under `less` to `visit`, in the order of the list.
template <class Less, class Visit>
void ForEachGroup(const CHarmAnlsCenterAlternatives& alternatives, Less less, Visit visit) {
    std::vector<CReading> readings = ReadingsOf(alternatives);
    std::stable_sort(readings.begin(), readings.end(), less);
    for (auto first = readings.begin(); first != readings.end();) {
        const auto last = std::find_if(
            first, readings.end(), [&](const CReading& reading) { return less(*first, reading); });
        visit(std::span<const CReading>(&*first, static_cast<std::size_t>(last - first)));
        first = last;
    }
}

bool EachHasOneCenter(const CHarmAnlsCenterAlternatives& alternatives) {
    return std::all_of(alternatives.begin(), alternatives.end(),
                       [](const auto& alternative) { return alternative.mCenters.size() == 1; });
}

/// With one center each, one erasure never spares another: what contains the container contains
/// the contained, too, and the longest one stays.
std::vector<bool> ContainedReadingsOfOneCenter(const CHarmAnlsCenterAlternatives& alternatives) {
    std::vector<CChordRange> ranges;
    ranges.reserve(alternatives.size());
    for (const CHarmAnlsCenterAlternative& alternative : alternatives) {
        const CHarmAnlsCenterInChords& center = alternative.mCenters.front();
        ranges.push_back({center.mBegin, center.mEnd});
    }
    return ContainedInLongerRange(ranges);
}

/// With several centers the order of the erasures counts. Pair by pair: such readings are made by
/// hand and few, the analysis makes readings of one center.
std::vector<bool> ContainedReadings(const CHarmAnlsCenterAlternatives& alternatives) {
    std::vector<bool> isErased(alternatives.size());
    for (std::size_t a = 0; a < alternatives.size(); ++a) {
        for (std::size_t b = 0; b < alternatives.size() && !isErased[a]; ++b) {
            isErased[a] = a != b && !isErased[b] &&
                          alternatives[b].IsLongerContainingAlternativeFor(alternatives[a]);
        }
    }
    return isErased;
}

}  // namespace

bool CHarmAnlsCenterAlternative::IsSimultaneousWith(const CHarmAnlsCenterAlternative& other) const {
    if (mCenters.empty() || other.mCenters.empty()) {
        return mCenters.empty() && other.mCenters.empty();
    }
    return mCenters.OverallBeginAndEndInputChord() == other.mCenters.OverallBeginAndEndInputChord();
}

bool CHarmAnlsCenterAlternative::IsLongerContainingAlternativeFor(
    const CHarmAnlsCenterAlternative& other) const {
    return mCenters.IsLongerAndContains(other.mCenters);
}

void CHarmAnlsCenterAlternatives::RemoveShorterContainedAlternatives() {
    const std::vector<bool> isContained =
        EachHasOneCenter(*this) ? ContainedReadingsOfOneCenter(*this) : ContainedReadings(*this);
    if (EraseMarked(*this, isContained)) RecalculateProbabilitiesOfSimultaneousAlternatives();
}

std::vector<std::reference_wrapper<CHarmAnlsCenterAlternative>>
CHarmAnlsCenterAlternatives::FindSimultaneousAlternatives(iterator it) {
    std::vector<std::reference_wrapper<CHarmAnlsCenterAlternative>> simultaneous;
    for (auto other = begin(); other != end(); ++other) {
        if (other != it && other->IsSimultaneousWith(*it)) simultaneous.emplace_back(*other);
    }
    return simultaneous;
}

bool CHarmAnlsCenterAlternatives::HasLongerContainingAlternernative(const_iterator it) const {
    return std::any_of(begin(), end(), [&](const CHarmAnlsCenterAlternative& other) {
        return &other != &*it && other.IsLongerContainingAlternativeFor(*it);
    });
}

void CHarmAnlsCenterAlternatives::RecalculateProbabilitiesOfSimultaneousAlternatives() {
    ForEachGroup(*this, LessByOverallRange, [this](std::span<const CReading> group) {
        if (group.size() == 1) return;
        for (const CReading& reading : group) {
            (*this)[reading.mPlace].mProbability = 1.0 / static_cast<double>(group.size());
        }
    });
}

void CHarmAnlsCenterAlternatives::RemoveShorterContainedHarmCenters() {
    for (CHarmAnlsCenterAlternative& alternative : *this) {
        alternative.RemoveShorterContainedHarmCenters();
    }
}

void CHarmAnlsCenterAlternatives::Deduplication() {
    std::vector<bool> isRepeated(size());
    ForEachGroup(*this, LessByCenters, [&](std::span<const CReading> group) {
        CHarmAnlsCenterAlternative& kept = (*this)[group.front().mPlace];
        for (const CReading& repeated : group.subspan(1)) {
            kept.mProbability += (*this)[repeated.mPlace].mProbability;
            isRepeated[repeated.mPlace] = true;
        }
    });
    EraseMarked(*this, isRepeated);
    RecalculateProbabilitiesOfSimultaneousAlternatives();
}

void CHarmAnlsCenterAlternatives::RemoveNonSureAlternativesWithSameRangeAsSureAlternative() {
    std::vector<bool> isOutdone(size());
    ForEachGroup(*this, LessByRanges, [&](std::span<const CReading> group) {
        bool isSure = false;
        for (const CReading& reading : group) {
            isOutdone[reading.mPlace] = isSure;
            isSure = isSure || (*this)[reading.mPlace].mProbability == 1.0;
        }
    });
    EraseMarked(*this, isOutdone);
}

}  // namespace brindle
