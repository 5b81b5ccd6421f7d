// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CIntvlSet.h"
#include "brindle/theory/CSemitones.h"

#include <string_view>

namespace brindle {

class CHarmAnlsChord;

// The words for kinds of chords in lead sheets ("major", "dominant-ninth"), as MusicXML defines
// them, and the tones that they stand for.

/// The semitones above the root, 0 among them, up to 21. Empty for "none" and for any other word.
/// Words are compared exactly.
[[nodiscard]] CIntvlSet XMLHarmonyKindToIntvlSetExceptRoot(std::string_view kind);
/// The same within one octave; bit 0 is always set.
[[nodiscard]] CSemitones XMLHarmonyKindToSemitones(std::string_view kind);
/// The word for exactly these semitones; "none" if there is no such word.
[[nodiscard]] std::string_view SemitonesToXMLHarmonyKind(CSemitones semitones);
/// The word for exactly the tones of a chord, from its root on.
[[nodiscard]] std::string_view ChordToXMLHarmonyKind(const CHarmAnlsChord& chord);

}  // namespace brindle
