// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChBasicChord.h"

#include "brindle/guitarchords/GChChord.h"
#include "brindle/guitarchords/GChHarmonyStrings.h"
#include "brindle/guitarchords/GChLibrary.h"
#include "brindle/guitarchords/GChPitches.h"
#include "brindle/guitarchords/internal/SoundingFrets.h"

#include <nlohmann/json.hpp>

#include <algorithm>

namespace brindle {

namespace {

// Most fingerings fit without a second allocation.
constexpr std::size_t kUsualElemCount = 8;
constexpr int kMaskBits = 8;

std::uint32_t FavoriteBit(int transposeIndex) {
    return std::uint32_t{1} << (static_cast<unsigned>(transposeIndex) % 32);
}

}  // namespace

GChBasicChord::GChBasicChord(const GChShortTuning& shortTuning) : mShortTuning(shortTuning) {
    mChordElems.reserve(kUsualElemCount);
}

std::shared_ptr<GChTuning> GChBasicChord::gchTuning() const {
    const std::shared_ptr<GChLibrary> library = gchLibrary();
    return library == nullptr ? nullptr : library->gchTuning();
}

int GChBasicChord::numberOfStrings() const {
    return GChNumberOfStringsInShortTuning(mShortTuning);
}

bool GChBasicChord::isFavoriteForTransposeIndex(int index) const {
    return (mIsFavoriteMask & FavoriteBit(index)) != 0;
}

void GChBasicChord::setIsFavorite(bool isFavorite, int transposeIndex) {
    const std::uint32_t bit = FavoriteBit(transposeIndex);
    mIsFavoriteMask = isFavorite ? mIsFavoriteMask | bit : mIsFavoriteMask & ~bit;
}

bool GChBasicChord::isMutedForStringIndex(int stringIndex) const {
    if (stringIndex < 0) return false;
    // The sign fills the bits above.
    return (mIsMutedMask >> std::min(stringIndex, kMaskBits - 1) & 1) != 0;
}

void GChBasicChord::setMuted(bool isMuted, int stringIndex) {
    if (stringIndex < 0 || stringIndex >= kMaskBits) return;
    const int bit = 1 << stringIndex;
    setIsMutedMask(isMuted ? mIsMutedMask | bit : mIsMutedMask & ~bit);
}

bool GChBasicChord::isOpenForStringIndex(int stringIndex) const {
    return maxAbsFretIndexPlusOneForStringIndex(stringIndex) == 0;
}

bool GChBasicChord::hasOpenStrings() const {
    for (int i = 0; i < numberOfStrings(); ++i) {
        if (isOpenForStringIndex(i)) return true;
    }
    return false;
}

int GChBasicChord::maxAbsFretIndexPlusOneForStringIndex(int stringIndex) const {
    if (stringIndex < 0 || stringIndex >= kGChMaxStrings) return -1;
    if (isMutedForStringIndex(stringIndex)) return -1;
    const auto elemAt = [this](std::size_t i) -> const GChChordElem& { return mChordElems[i]; };
    return SoundingFret(mChordElems.size(), elemAt, stringIndex);
}

int GChBasicChord::firstShownFretForNumberOfFrets(int frets) const {
    int lowest = 100;
    int highest = 0;
    for (const GChChordElem& elem : mChordElems) {
        lowest = std::min(lowest, elem.absFretIndex());
        highest = std::max(highest, elem.absFretIndex());
    }
    return highest < frets ? 0 : lowest;
}

int GChBasicChord::lowestFingeredFret() const {
    constexpr int kNone = kGChFrets * kGChFrets;
    int lowest = kNone;
    for (const GChChordElem& elem : mChordElems) {
        if (elem.absFretIndex() >= 0) lowest = std::min(lowest, elem.absFretIndex());
    }
    return lowest == kNone ? 0 : lowest;
}

void GChBasicChord::shiftFretIndexesBy(int frets) {
    for (GChChordElem& elem : mChordElems) elem.shiftFretIndexBy(frets);
}

bool GChBasicChord::isEqualToChordRange(const GChBasicChord& other,
                                        bool includeFavoriteMask) const {
    if (mIsMutedMask != other.mIsMutedMask) return false;
    if (includeFavoriteMask && mIsFavoriteMask != other.mIsFavoriteMask) return false;
    if (mDifficultyLevel != other.mDifficultyLevel || mRootNote != other.mRootNote ||
        mBassNote != other.mBassNote || mChordType != other.mChordType) {
        return false;
    }
    // Each with each: a hand has few fingers, and a file at most 15 elements.
    const auto isInOther = [&](const GChChordElem& elem) {
        return std::any_of(
            other.mChordElems.begin(), other.mChordElems.end(),
            [&](const GChChordElem& theirs) { return elem.isEqualToChordElem(theirs); });
    };
    return mChordElems.size() == other.mChordElems.size() &&
           std::all_of(mChordElems.begin(), mChordElems.end(), isInOther);
}

bool GChBasicChord::isEmpty() const {
    return mChordElems.empty() && mIsMutedMask == 0 && mIsFavoriteMask == 0 &&
           mDifficultyLevel == 0 && mRootNote == -1 && mBassNote == -1 && mChordType == 0;
}

void GChBasicChord::clearAll() {
    mChordElems.clear();
    mIsMutedMask = 0;
    mIsFavoriteMask = 0;
    mDifficultyLevel = 0;
    mRootNote = -1;
    mBassNote = -1;
    mChordType = 0;
}

std::optional<std::string> GChBasicChord::chordName(int enhType, int capodasterOffset) const {
    if (!mUserName.empty()) return GChUserChordName(mRootNote, mUserName);
    // The functions on names only read the chord.
    const auto self = std::make_shared<GChBasicChord>(*this);
    const std::optional<GChChord> chord = GChChord::make(self, 0);
    return GChHarmonyStringFromChord(&*chord, mRootNote, enhType, capodasterOffset);
}

nlohmann::json GChBasicChord::propertyList() const {
    nlohmann::json elems = nlohmann::json::array();
    for (const GChChordElem& elem : mChordElems) elems.push_back(elem.propertyList());
    return {{"shortTuning", GChPitchArrayFromShortTuning(mShortTuning)},
            {"chordElems", std::move(elems)},
            {"isMutedMask", static_cast<std::uint16_t>(mIsMutedMask)},
            {"isFavoriteMask", mIsFavoriteMask},
            {"difficultyLevel", mDifficultyLevel},
            {"rootNote", mRootNote},
            {"bassNote", mBassNote},
            {"chordType", static_cast<std::uint16_t>(mChordType)},
            {"userName", mUserName}};
}

}  // namespace brindle
