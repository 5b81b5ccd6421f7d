// SPDX-License-Identifier: MIT
#include "brindle/musicxml/TMusicXMLHarmony.h"

#include "brindle/theory/CChordNamePrefs.h"

#include <algorithm>

namespace brindle {

CKeyEnh TMusicXMLPitch::ToKeyEnh(const CChordNamePrefs& prefs) const {
    CKeyEnh keyEnh;
    keyEnh.SetFromString(mStep, nullptr, prefs);
    if (keyEnh.IsUndef()) return keyEnh;
    const int alter = std::clamp(mAlter, -2, 2);
    return {(keyEnh.mKeyNr + alter + 12) % 12, static_cast<TEnh>(alter + TEnh_n)};
}

bool TMusicXMLHarmony::CompareAllMembers(const TMusicXMLHarmony& other, TComparePos mode) const {
    if (mode == TComparePos_Yes && mPosition != other.mPosition) return false;
    return mKind == other.mKind && mRoot == other.mRoot && mBass == other.mBass &&
           mDuration == other.mDuration && mExtraText1 == other.mExtraText1;
}

}  // namespace brindle
