// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/chords/ChordDegree.h"
#include "brindle/theory/CKeyEnh.h"

#include <vector>

namespace brindle {

/// The tones of a chord from its root up, each once, spelled as its symbol tells them: C Eb Gb Bbb
/// for Co7. A tone that would take more than a double sign has the letter of another. A bass that
/// is no chord tone is none of them. Empty for what is no chord.
[[nodiscard]] std::vector<CKeyEnh> ChordTones(const CChordLite& chord);

/// The tone 0 to 11 semitones above the root, spelled as if the chord had it: Bb for 10 above Cm.
[[nodiscard]] CKeyEnh ToneAboveRoot(const CChordLite& chord, int intvl);

/// The degree as which a chord has one of its tones, 0 to 11 semitones above its root: the D of Cm9
/// is its 9, that of Csus2 its 2. No degree for what is none of its tones.
[[nodiscard]] CChordDegree DegreeOfTone(const CChordLite& chord, int intvl);

}  // namespace brindle
