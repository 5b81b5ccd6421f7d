// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordTypes.h"
#include "brindle/theory/CSemitones.h"

#include <string>

namespace brindle {

// The built-in chord types, as a list that a host shows.

/// How many there are, 30.
[[nodiscard]] int GChNumberOfChordTypes();
/// A negative index counts as 0; empty at or above the number of rows.
[[nodiscard]] std::string GChChordTypeNameForIndex(int index);
/// A negative index counts as 0; 0 at or above the number of rows.
[[nodiscard]] CChordTypeId GChChordTypeIdForIndex(int index);
/// Empty if there is none.
[[nodiscard]] std::string GChChordTypeNameForId(CChordTypeId id);

/// The first type that has these tones, in whatever octave; 0 if there is none.
[[nodiscard]] CChordTypeId GChChordTypeIdForSemitones(const CSemitones& semitones);

}  // namespace brindle
