// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChChordElem.h"

#include "brindle/guitarchords/GChShortTuning.h"

#include <nlohmann/json.hpp>

namespace brindle {

std::optional<GChChordElem> GChChordElem::make(int fingerNumber, int absFretIndex,
                                               int coveredMinStr, int coveredMaxStr,
                                               std::uint8_t fingerPointType) {
    if (fingerNumber < 0 || fingerNumber >= kGChFingers) return std::nullopt;
    if (absFretIndex < 0 || absFretIndex >= kGChFrets) return std::nullopt;
    if (coveredMinStr < 0 || coveredMinStr > coveredMaxStr) return std::nullopt;
    if (coveredMaxStr >= kGChMaxStrings) return std::nullopt;
    GChChordElem elem;
    elem.mFingerNumber = static_cast<std::uint8_t>(fingerNumber);
    elem.mAbsFretIndex = static_cast<std::int8_t>(absFretIndex);
    elem.mCoveredMinStr = static_cast<std::uint8_t>(coveredMinStr);
    elem.mCoveredMaxStr = static_cast<std::uint8_t>(coveredMaxStr);
    elem.mFingerPointType = fingerPointType;
    return elem;
}

int GChChordElem::singleStringIndex() const {
    return isSingleSpot() ? mCoveredMinStr : -1;
}

void GChChordElem::setCoveredMinStr(std::uint8_t minStr, std::uint8_t maxStr) {
    mCoveredMinStr = minStr;
    mCoveredMaxStr = maxStr;
}

void GChChordElem::shiftFretIndexBy(int frets) {
    mAbsFretIndex = static_cast<std::int8_t>(static_cast<unsigned>(mAbsFretIndex) +
                                             static_cast<unsigned>(frets));
}

bool GChChordElem::isEqualToChordElem(const GChChordElem& other) const {
    return mFingerNumber == other.mFingerNumber && mAbsFretIndex == other.mAbsFretIndex &&
           mCoveredMaxStr == other.mCoveredMaxStr && mCoveredMinStr == other.mCoveredMinStr &&
           mFingerPointType == other.mFingerPointType;
}

nlohmann::json GChChordElem::propertyList() const {
    return {{"fingerNumber", mFingerNumber},
            {"absFretIndex", static_cast<std::uint8_t>(mAbsFretIndex)},
            {"coveredMaxStr", mCoveredMaxStr},
            {"coveredMinStr", mCoveredMinStr},
            {"fingerPointType", mFingerPointType}};
}

}  // namespace brindle
