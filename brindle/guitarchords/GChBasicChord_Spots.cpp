// SPDX-License-Identifier: MIT
// The elements of a fingering: adding, finding, counting and removing them.
#include "brindle/guitarchords/GChBasicChord.h"

#include <algorithm>
#include <tuple>
#include <utility>

namespace brindle {

namespace {

using TElems = std::vector<GChChordElem>;

bool IsAnyPoint(const GChChordElem&) {
    return true;
}

bool IsOptional(const GChChordElem& elem) {
    return elem.fingerPointType() == GChFingerPointType_Optional;
}

bool IsReal(const GChChordElem& elem) {
    return elem.isReal();
}

template <class TTest>
const GChChordElem* FirstOf(const TElems& elems, TTest test) {
    const auto found = std::find_if(elems.begin(), elems.end(), test);
    return found == elems.end() ? nullptr : &*found;
}

/// Tells the single spots of a string that are of one kind.
template <class TKind>
auto SpotsOf(int stringIndex, TKind isOfKind) {
    return [=](const GChChordElem& elem) {
        return elem.singleStringIndex() == stringIndex && stringIndex >= 0 && isOfKind(elem);
    };
}

/// Tells the elements over exactly these strings, told in any order.
auto SpansOf(int strIndex0, int strIndex1) {
    const auto [lower, upper] = std::minmax({strIndex0, strIndex1});
    return [lower = lower, upper = upper](const GChChordElem& elem) {
        return elem.coveredMinStr() == lower && elem.coveredMaxStr() == upper;
    };
}

/// The first of those with the highest fret, or null.
template <class TTest>
const GChChordElem* HighestOf(const TElems& elems, TTest test) {
    const GChChordElem* highest = nullptr;
    for (const GChChordElem& elem : elems) {
        if (!test(elem)) continue;
        if (highest == nullptr || elem.absFretIndex() > highest->absFretIndex()) highest = &elem;
    }
    return highest;
}

template <class TTest>
int CountOf(const TElems& elems, TTest test) {
    return static_cast<int>(std::count_if(elems.begin(), elems.end(), test));
}

template <class TTest>
void Remove(TElems& elems, TTest test, bool onlyHighest) {
    if (!onlyHighest) {
        std::erase_if(elems, test);
        return;
    }
    if (const GChChordElem* const highest = HighestOf(elems, test)) {
        elems.erase(elems.begin() + (highest - elems.data()));
    }
}

}  // namespace

std::vector<GChChordElem> GChBasicChord::sortedChordElems() const {
    const auto order = [](const GChChordElem& elem) {
        return std::make_tuple(elem.absFretIndex(), elem.coveredMinStr(), elem.coveredMaxStr(),
                               elem.fingerNumber());
    };
    std::vector<GChChordElem> sorted = mChordElems;
    std::stable_sort(sorted.begin(), sorted.end(),
                     [&](const auto& a, const auto& b) { return order(a) < order(b); });
    return sorted;
}

GChChordElem* GChBasicChord::addChordElem(const void* /*sender*/, int fingerNumber,
                                          int absFretIndex, int stringIndex1, int stringIndex2,
                                          std::uint8_t fingerPointType) {
    const auto elem =
        GChChordElem::make(fingerNumber, absFretIndex, stringIndex1, stringIndex2, fingerPointType);
    if (!elem) return nullptr;
    mChordElems.push_back(*elem);
    return &mChordElems.back();
}

GChChordElem* GChBasicChord::addChordElem(const void* sender, int fingerNumber, int absFretIndex,
                                          int stringIndex1, int stringIndex2) {
    return addChordElem(sender, fingerNumber, absFretIndex, stringIndex1, stringIndex2,
                        GChFingerPointType_Real);
}

GChChordElem* GChBasicChord::addChordElem(const void* sender, int fingerNumber, int absFretIndex,
                                          int stringIndex) {
    return addChordElem(sender, fingerNumber, absFretIndex, stringIndex, stringIndex);
}

void GChBasicChord::removeChordElem(const GChChordElem* elem) {
    removeChordElems({&elem, 1});
}

void GChBasicChord::removeChordElems(std::span<const GChChordElem* const> elems) {
    std::vector<const GChChordElem*> addresses(elems.begin(), elems.end());
    std::sort(addresses.begin(), addresses.end(), std::less<>());
    TElems rest;
    rest.reserve(mChordElems.capacity());
    for (const GChChordElem& elem : mChordElems) {
        const bool goes =
            std::binary_search(addresses.begin(), addresses.end(), &elem, std::less<>());
        if (!goes) rest.push_back(elem);
    }
    mChordElems = std::move(rest);
}

const GChChordElem* GChBasicChord::elemAtAbsFretIndex(int absFretIndex, int stringIndex) const {
    if (absFretIndex >= kGChFrets || stringIndex < 0 || stringIndex >= kGChMaxStrings) {
        return nullptr;
    }
    return FirstOf(mChordElems, [&](const GChChordElem& elem) {
        return elem.absFretIndex() == absFretIndex && elem.coversString(stringIndex);
    });
}

const GChChordElem* GChBasicChord::spotAtAbsFretIndex(int absFretIndex, int stringIndex) const {
    const auto isSpot = SpotsOf(stringIndex, IsAnyPoint);
    return FirstOf(mChordElems, [&](const GChChordElem& elem) {
        return isSpot(elem) && elem.absFretIndex() == absFretIndex;
    });
}

const GChChordElem* GChBasicChord::realSpotAtMaxIndexForStringIndex(int stringIndex) const {
    return HighestOf(mChordElems, SpotsOf(stringIndex, IsReal));
}

const GChChordElem* GChBasicChord::optionalSpotAtMaxIndexForStringIndex(int stringIndex) const {
    return HighestOf(mChordElems, SpotsOf(stringIndex, IsOptional));
}

bool GChBasicChord::hasSingleSpot(const void* /*sender*/, int strIndex, int fretIndex) const {
    return spotAtAbsFretIndex(fretIndex, strIndex) != nullptr;
}

bool GChBasicChord::hasSingleSpot(const void* /*sender*/, int strIndex, int fretIndex,
                                  int fingerNum) const {
    const auto isSpot = SpotsOf(strIndex, IsAnyPoint);
    return FirstOf(mChordElems, [&](const GChChordElem& elem) {
               return isSpot(elem) && elem.absFretIndex() == fretIndex &&
                      elem.fingerNumber() == fingerNum;
           }) != nullptr;
}

bool GChBasicChord::hasBarreSpot(const void* /*sender*/, int strIndex0, int strIndex1,
                                 int fretIndex) const {
    const auto isSpan = SpansOf(strIndex0, strIndex1);
    return FirstOf(mChordElems, [&](const GChChordElem& elem) {
               return isSpan(elem) && elem.absFretIndex() == fretIndex;
           }) != nullptr;
}

bool GChBasicChord::hasBarreSpot(const void* /*sender*/, int strIndex0, int strIndex1,
                                 int fretIndex, int fingerNum) const {
    const auto isSpan = SpansOf(strIndex0, strIndex1);
    return FirstOf(mChordElems, [&](const GChChordElem& elem) {
               return isSpan(elem) && elem.absFretIndex() == fretIndex &&
                      elem.fingerNumber() == fingerNum;
           }) != nullptr;
}

int GChBasicChord::fretIndexForBarreSpot(const void* /*sender*/, int strIndex0,
                                         int strIndex1) const {
    const GChChordElem* const elem = FirstOf(mChordElems, SpansOf(strIndex0, strIndex1));
    return elem == nullptr ? -1 : elem->absFretIndex();
}

bool GChBasicChord::liesInBarreShadow(const void* /*sender*/, int absFretIndex, int stringIndex1,
                                      int stringIndex2) const {
    return FirstOf(mChordElems, [&](const GChChordElem& elem) {
               return elem.isBarre() && elem.absFretIndex() <= absFretIndex &&
                      elem.coversString(stringIndex1) && elem.coversString(stringIndex2);
           }) != nullptr;
}

int GChBasicChord::numberOfSpotsForStringIndex(int stringIndex) const {
    return CountOf(mChordElems, SpotsOf(stringIndex, IsAnyPoint));
}

int GChBasicChord::numberOfOptionalSpotsForStringIndex(int stringIndex) const {
    return CountOf(mChordElems, SpotsOf(stringIndex, IsOptional));
}

int GChBasicChord::numberOfRealSpotsForStringIndex(int stringIndex) const {
    return CountOf(mChordElems, SpotsOf(stringIndex, IsReal));
}

void GChBasicChord::removeSpotsForStringIndex(int stringIndex, bool onlyLastElement) {
    Remove(mChordElems, SpotsOf(stringIndex, IsAnyPoint), onlyLastElement);
}

void GChBasicChord::removeOptionalSpotsForStringIndex(int stringIndex, bool onlyLastElement) {
    Remove(mChordElems, SpotsOf(stringIndex, IsOptional), onlyLastElement);
}

void GChBasicChord::removeRealSpotsForStringIndex(int stringIndex, bool onlyLastElement) {
    Remove(mChordElems, SpotsOf(stringIndex, IsReal), onlyLastElement);
}

}  // namespace brindle
