// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/NameNotes.h"
#include "brindle/guitarchords/GChShortTuning.h"

#include <span>
#include <vector>

namespace brindle {

/// Names what the strings of a fingering sound as a guitarist would: x02010 is Am7 and 200232 D/F#.
/// `pitches` are MIDI numbers from the string with the lowest index, negative for a muted string.
/// NameNotes and the net that hears roots judge together, and what players mind in a name: whole
/// chords before ones that lack several tones, Em/A before A7sus2. On a tuning that bears no bass
/// (see BearsBass) no name has a slash. Without a string that sounds there is no name.
[[nodiscard]] std::vector<CNamedChord> NameFingering(std::span<const int> pitches,
                                                     const GChShortTuning& tuning);

}  // namespace brindle
