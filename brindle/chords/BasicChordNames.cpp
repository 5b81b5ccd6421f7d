// SPDX-License-Identifier: MIT
#include "brindle/chords/BasicChordNames.h"
#include "brindle/theory/KeyNames.h"

namespace brindle {

std::string_view BasicChordName(TBasicChord basicChord, const CChordNamePrefs& /*prefs*/) {
    // clang-format off
    switch (basicChord) {
        case TBasicChord::Major:      return "";
        case TBasicChord::Minor:      return "m";
        case TBasicChord::Augmented:  return "aug";
        case TBasicChord::Diminished: return "dim";
        case TBasicChord::Sus4:       return "sus4";
        case TBasicChord::Sus2:       return "sus2";
        case TBasicChord::Drone:      return "5";
        case TBasicChord::None:       break;
    }
    // clang-format on
    return "no 3";
}

std::string BasicChordNameWithPreceedingOptionalSpace(TBasicChord basicChord,
                                                      const CChordNamePrefs& prefs) {
    if (basicChord == TBasicChord::Major) return {};
    std::string name(OptionalSpaceBetweenNameParts(prefs));
    name += BasicChordName(basicChord, prefs);
    return name;
}

}  // namespace brindle
