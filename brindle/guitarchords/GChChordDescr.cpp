// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChChordDescr.h"

#include "brindle/guitarchords/GChHarmonyStrings.h"
#include "brindle/guitarchords/GChTuningDescr.h"
#include "brindle/guitarchords/internal/SoundingFrets.h"

#include <algorithm>
#include <cstddef>

namespace brindle {

bool GChChordDescr::addFingerNum(int fingerNum, int absFret, int minStrIndex, int maxStrIndex,
                                 std::uint8_t fingerPointType) {
    const auto elem =
        GChChordElemDescr::make(fingerNum, absFret, minStrIndex, maxStrIndex, fingerPointType);
    if (!elem || mNumberOfElements >= kGChMaxElements) return false;
    const std::size_t index = mNumberOfElements++;
    mFingers[index] = static_cast<std::uint8_t>(elem->fingerNumber());
    mFrets[index] = static_cast<std::uint8_t>(elem->absFretIndex());
    mMinStrings[index] = static_cast<std::uint8_t>(elem->coveredMinStr());
    mMaxStrings[index] = static_cast<std::uint8_t>(elem->coveredMaxStr());
    mTypes[index] = elem->fingerPointType();
    return true;
}

bool GChChordDescr::addFingerNum(int fingerNum, int absFret, int minStrIndex, int maxStrIndex) {
    return addFingerNum(fingerNum, absFret, minStrIndex, maxStrIndex, GChFingerPointType_Real);
}

bool GChChordDescr::addFingerNum(int fingerNum, int absFret, int strIndex) {
    return addFingerNum(fingerNum, absFret, strIndex, strIndex);
}

std::vector<GChChordElemDescr> GChChordDescr::chordElems() const {
    std::vector<GChChordElemDescr> elems;
    elems.reserve(mNumberOfElements);
    for (std::size_t i = 0; i < mNumberOfElements; ++i) elems.push_back(_ElemAt(i));
    return elems;
}

std::vector<GChChordElemDescr> GChChordDescr::chordElemsSortedByFret() const {
    std::vector<GChChordElemDescr> elems = chordElems();
    std::stable_sort(elems.begin(), elems.end(), [](const auto& a, const auto& b) {
        return a.absFretIndex() < b.absFretIndex();
    });
    return elems;
}

int GChChordDescr::lowestAbsFretIndex() const {
    return *std::min_element(mFrets.begin(), mFrets.begin() + std::max<int>(mNumberOfElements, 1));
}

bool GChChordDescr::isMutedForStringIndex(int stringIndex) const {
    return stringIndex >= 0 && stringIndex < kGChMaxStrings && (mMuteBits >> stringIndex & 1) != 0;
}

void GChChordDescr::setMuted(bool isMuted, int stringIndex) {
    if (stringIndex < 0 || stringIndex >= kGChMaxStrings) return;
    const int bit = 1 << stringIndex;
    mMuteBits = static_cast<std::uint16_t>(isMuted ? mMuteBits | bit : mMuteBits & ~bit);
}

int GChChordDescr::pitchForStringIndex1(int stringIndex, const GChTuningDescr& tuning) const {
    const int openPitch = tuning.openStringPitchForStringIndex(stringIndex);
    if (openPitch < 0 || isMutedForStringIndex(stringIndex)) return -1;
    // 255 is no capodaster.
    const auto capodaster = static_cast<std::int8_t>(tuning.capodasterOffset());
    const int fret = SoundingFret(
        mNumberOfElements, [this](std::size_t i) { return _ElemAt(i); }, stringIndex);
    return SoundingPitch(openPitch, fret, capodaster);
}

std::optional<std::string> GChChordDescr::chordNameWithTuningDescr(
    const GChTuningDescr& tuning) const {
    return GChHarmonyStringFromChordDescr(this, &tuning, mRootNote, -1);
}

GChChordElemDescr GChChordDescr::_ElemAt(std::size_t index) const {
    // It was checked when it was added.
    return *GChChordElemDescr::make(mFingers[index], mFrets[index], mMinStrings[index],
                                    mMaxStrings[index], mTypes[index]);
}

}  // namespace brindle
