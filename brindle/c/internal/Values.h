// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/c/brindle.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/CSignKeyLite.h"

#include <cstddef>
#include <string>
#include <vector>

/// The values of C and those of the library. Values of C are made by hand: what is out of range
/// becomes undefined.
namespace brindle::border {

[[nodiscard]] brindle_tone ToC(const CKeyEnh& key);
[[nodiscard]] brindle_key ToC(const CSignKeyLite& key);
[[nodiscard]] brindle_scale ToC(const CScaleLite& scale);
[[nodiscard]] brindle_chord ToC(const CChordLite& chord);

[[nodiscard]] CKeyEnh FromC(const brindle_tone& tone);
[[nodiscard]] CSignKeyLite FromC(const brindle_key& key);
[[nodiscard]] CScaleLite FromC(const brindle_scale& scale);
[[nodiscard]] CChordLite FromC(const brindle_chord& chord);
/// Null is the default style.
[[nodiscard]] CChordSymbolStyle FromC(const brindle_style* style);

/// Of BRINDLE_READ_... flags.
[[nodiscard]] CChordTextOptions ChordOptionsOf(unsigned flags);

/// At most 12.
void GiveTones(const std::vector<CKeyEnh>& keys, brindle_tone* tones, std::size_t* count);

}  // namespace brindle::border
