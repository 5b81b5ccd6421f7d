// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CHarmCenterLite.h"
#include "brindle/theory/CSignKeyLite.h"

#include <string>

namespace brindle {

/// How strongly a shape shows the color of its key: lightness in percent.
enum TShade : int {
    Shade_Region = 76,
    Shade_Center = 68,
    Shade_SignKey = 82,
    Shade_Reading = 82,
    Shade_Chord = 93,
    Shade_Sheet = 96,  ///< behind the chords of a lead sheet, and the names of its keys
    Shade_SheetName = 34,
    Shade_NightSheet = 20,  ///< the same on dark paper
    Shade_NightSheetName = 78,
};

/// The color of a key as "#rrggbb": neighbours on the circle of fifths have neighbouring colors,
/// and minor keys are darker. Without a key it is gray.
[[nodiscard]] std::string ColorOf(const CKeyEnh& root, bool isMinor, TShade shade);
/// The same for a key.
[[nodiscard]] std::string ColorOf(const CSignKeyLite& key, TShade shade);
/// The same for a center, which is minor with a minor third and no major one.
[[nodiscard]] std::string ColorOf(const CHarmCenterLite& center, TShade shade);

}  // namespace brindle
