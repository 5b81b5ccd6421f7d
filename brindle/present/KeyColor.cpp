// SPDX-License-Identifier: MIT
#include "brindle/present/KeyColor.h"

#include "brindle/present/CSvg.h"

namespace brindle {
namespace {

// By how much minor keys are darker.
int MinorShade(TShade shade) {
    return shade == Shade_Sheet || shade == Shade_NightSheet ? 3 : 7;
}

}  // namespace

std::string ColorOf(const CKeyEnh& root, bool isMinor, TShade shade) {
    if (root.IsUndef()) return "#ececec";
    const int placeOnCircleOfFifths = root.mKeyNr * 7 % 12;
    // Behind light letters a full color is too loud.
    const int saturation = shade == Shade_NightSheet ? 26 : 65;
    return HslColor((placeOnCircleOfFifths * 30 + 50) % 360, saturation,
                    static_cast<int>(shade) - (isMinor ? MinorShade(shade) : 0));
}

std::string ColorOf(const CSignKeyLite& key, TShade shade) {
    return ColorOf(key.mRootKeyEnh, key.mSignKeyType == TSignKeyType_Minor, shade);
}

std::string ColorOf(const CHarmCenterLite& center, TShade shade) {
    const bool isMinor = center.mSemitones.HasIntvl(3) && !center.mSemitones.HasIntvl(4);
    return ColorOf(center.mRootKeyEnh, isMinor, shade);
}

}  // namespace brindle
