// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/TBasicChord.h"

#include <string>
#include <string_view>

namespace brindle {

struct CChordNamePrefs;

/// What stands behind the root for the skeleton of a chord: "m", "aug", "sus4"; nothing for major.
/// The preferences make no difference.
[[nodiscard]] std::string_view BasicChordName(TBasicChord basicChord, const CChordNamePrefs& prefs);

/// The same after OptionalSpaceBetweenNameParts; nothing for major.
[[nodiscard]] std::string BasicChordNameWithPreceedingOptionalSpace(TBasicChord basicChord,
                                                                    const CChordNamePrefs& prefs);

}  // namespace brindle
