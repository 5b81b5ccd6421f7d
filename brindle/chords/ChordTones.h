// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CKeyEnh.h"

#include <vector>

namespace brindle {

/// The tones of a chord from its root up, each once, spelled as its symbol tells them: C Eb Gb Bbb
/// for Co7. A tone that would take more than a double sign has the letter of another. A bass that
/// is no chord tone is none of them. Empty for what is no chord.
[[nodiscard]] std::vector<CKeyEnh> ChordTones(const CChordLite& chord);

}  // namespace brindle
