// SPDX-License-Identifier: MIT
#include "brindle/theory/CHarmCenterLite.h"

#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/RelativeKeys.h"

#include <algorithm>
#include <array>
#include <ostream>
#include <string_view>

namespace brindle {

namespace {

struct CModeName {
    CSemitones mSemitones;
    std::string_view mSuffix;
};

constexpr auto kModeNames = std::to_array<CModeName>({
    {CSemitones(2741), " Major"},
    {CSemitones(1453), " Minor"},
    {CSemitones(1709), " Dorian"},
    {CSemitones(1451), " Phrygian"},
    {CSemitones(2773), " Lydian"},
    {CSemitones(1717), " Mixolydian"},
    {CSemitones(1387), " Locrian"},
});

std::string_view ModeSuffix(CSemitones semitones) {
    const auto row =
        std::find_if(kModeNames.begin(), kModeNames.end(),
                     [semitones](const CModeName& mode) { return mode.mSemitones == semitones; });
    return row == kModeNames.end() ? std::string_view() : row->mSuffix;
}

}  // namespace

CHarmCenterLite::CHarmCenterLite(const CSignKeyLite& signKey) {
    const CSemitones semitones = signKey.Semitones();
    if (!semitones.IsEmpty()) *this = {signKey.mRootKeyEnh, semitones};
}

int CHarmCenterLite::KeyNrToHarmCenterKeyNr(int keyNr) const {
    return RelativeKeyNr(mRootKeyEnh.mKeyNr, keyNr);
}

int CHarmCenterLite::HarmCenterKeyNrToKeyNr(int harmCenterKeyNr) const {
    return KeyNrFromRelativeKeyNr(mRootKeyEnh.mKeyNr, harmCenterKeyNr);
}

std::string CHarmCenterLite::NameShort(const CChordNamePrefs& prefs) const {
    if (IsUndef()) return "Undef";
    const std::string root = KeyNrAndEnhToName(mRootKeyEnh.mKeyNr, mRootKeyEnh.mEnh, prefs);
    return mSemitones == kSemitonesNaturalMinor ? root + "m" : root;
}

std::string CHarmCenterLite::NameLong(const CChordNamePrefs& prefs) const {
    if (IsUndef()) return "Undef";
    std::string name = KeyNrAndEnhToName(mRootKeyEnh.mKeyNr, mRootKeyEnh.mEnh, prefs);
    name += ModeSuffix(mSemitones);
    return name;
}

std::ostream& operator<<(std::ostream& stream, const CHarmCenterLite& center) {
    return stream << "CHarmCenterLite: RootKeyEnh " << center.mRootKeyEnh << ", Semitones "
                  << center.mSemitones;
}

}  // namespace brindle
