// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CScaleLite.h"

#include <string>
#include <string_view>
#include <utility>

namespace brindle {

struct CChordNamePrefs;

/// Reads a chord and the scale to play over it, as "Dm7; D dorian". Without a ";" the scale is
/// undefined; what stands behind a second one is not read.
[[nodiscard]] std::pair<CChordLite, CScaleLite> ChordAndScaleFromString(
    std::string_view text, const CChordNamePrefs& prefs);
/// The same; a null pointer gives the undefined chord and scale.
[[nodiscard]] std::pair<CChordLite, CScaleLite> ChordAndScaleFromString(
    const char* text, const CChordNamePrefs& prefs);

/// Writes the name of the chord and, unless the scale is undefined, "; " and that of the scale.
[[nodiscard]] std::string ChordAndScaleToString(const CChordLite& chord, const CScaleLite& scale,
                                                const CChordNamePrefs& prefs);

}  // namespace brindle
