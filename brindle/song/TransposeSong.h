// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSong.h"

namespace brindle {

/// The song so many semitones higher, or lower for a negative number. Its key, the stated one or
/// else the one that is found, is spelled with the fewest signs, and all chords move by that
/// interval; one that would need more than a double sign takes another letter. Symbols are written
/// by WriteChordSymbol, those of no chord stay as they are; without semitones all stay. Faults and
/// texts stay, too. Linear in the length of the song.
[[nodiscard]] CSong TransposeSong(const CSong& song, int semitones);

}  // namespace brindle
