// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlPartGatheredInfo.h"

namespace brindle {

namespace {

bool IsTreble(const CMuxmlClef& clef) {
    return clef.mSign == TMuxmlEnum_ClefSign_G && clef.mStaffLine == 2;
}

bool IsBass(const CMuxmlClef& clef) {
    return clef.mSign == TMuxmlEnum_ClefSign_F && clef.mStaffLine == 4;
}

}  // namespace

bool CMuxmlPartGatheredInfo::IsPianoPartAtBegin() const {
    if (mPositionedStaves.empty() || mPositionedStaves.front().second != 2) return false;
    if (mClefs.size() < 2) return false;
    const CMuxmlClef& first = mClefs[0];
    const CMuxmlClef& second = mClefs[1];
    if (first.mPositionAsMidiTicks != second.mPositionAsMidiTicks) return false;
    return (IsBass(first) && IsTreble(second)) || (IsTreble(first) && IsBass(second));
}

}  // namespace brindle
