// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChFilterParameter.h"

#include "brindle/guitarchords/GChBasicChord.h"

#include <algorithm>

namespace brindle {

namespace {

constexpr std::int64_t kNoRestriction = -1;
constexpr std::int64_t kKeys = 12;

std::int64_t EmptyOrValue(std::int64_t value) {
    if (value < -1) return kNoRestriction;
    return std::max<std::int64_t>(value, 0);
}

bool Fits(std::int64_t wanted, std::int64_t value) {
    return wanted == kNoRestriction || wanted == value;
}

}  // namespace

void GChFilterParameter::setRootNoteToFilter(std::int64_t root, std::int64_t enhType) {
    mRootEnhType = enhType;
    if (root >= kKeys) {
        mBassNoteToFilter = 0;
    } else {
        mRootNoteToFilter = std::max<std::int64_t>(root, -2);
    }
}

void GChFilterParameter::setBassNoteToFilter(std::int64_t bass, std::int64_t enhType) {
    mBassEnhType = enhType;
    mBassNoteToFilter = bass >= kKeys ? 0 : std::max<std::int64_t>(bass, -2);
}

void GChFilterParameter::setChordTypeToFilter(std::int64_t chordType) {
    mChordTypeToFilter = EmptyOrValue(chordType);
}

void GChFilterParameter::setDifficultyToFilter(std::int64_t difficulty) {
    mDifficultyToFilter = EmptyOrValue(difficulty);
}

void GChFilterParameter::setIsFavoriteToFilter(std::int64_t isFavorite) {
    mIsFavoriteToFilter = std::min<std::int64_t>(EmptyOrValue(isFavorite), 1);
}

bool GChFilterParameter::Accepts(const GChBasicChord& chord) const {
    return Fits(mRootNoteToFilter, chord.rootNote()) && Fits(mBassNoteToFilter, chord.bassNote()) &&
           Fits(mChordTypeToFilter, chord.chordType()) &&
           Fits(mDifficultyToFilter, chord.difficultyLevel()) &&
           Fits(mIsFavoriteToFilter, chord.isFavoriteForTransposeIndex(0) ? 1 : 0);
}

}  // namespace brindle
