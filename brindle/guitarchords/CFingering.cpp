// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/CFingering.h"

#include <algorithm>
#include <cstddef>

namespace brindle {

int CFingering::Pitch(int string) const {
    const auto at = static_cast<std::size_t>(string);
    return mFrets[at] < 0 ? kMutedString : mTuning[at] + mCapo + mFrets[at];
}

int CFingering::Position() const {
    int position = 0;
    for (const CFingerPlace& place : Fingers()) {
        position = position == 0 ? place.mFret : std::min<int>(position, place.mFret);
    }
    return position;
}

std::vector<GChChordElem> CFingering::Elems() const {
    std::vector<GChChordElem> elems;
    for (const CFingerPlace& place : Fingers()) {
        const auto elem =
            GChChordElem::make(place.mFinger, place.mFret - 1, place.mMinString, place.mMaxString);
        if (elem) elems.push_back(*elem);
    }
    return elems;
}

}  // namespace brindle
