// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/TScaleType.h"

#include <string_view>

namespace brindle {

struct CChordNamePrefs;

/// The name of a harmonic function, see CChordHeavy::HarmFuncIn: "IIm", or with `mChordPrefF` 1
/// its function letters, "Sp", which depend on the type of the scale it was found in. "undef" for
/// a number that is no function. Number 13, "bVII", has a name although no chord is given it.
[[nodiscard]] std::string_view HarmFuncName(int harmFunc, TScaleType type,
                                            const CChordNamePrefs& prefs);

}  // namespace brindle
