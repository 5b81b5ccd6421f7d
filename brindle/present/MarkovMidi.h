// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/VariableLengthMarkovModel.h"
#include "brindle/present/MidiFile.h"

namespace brindle {

/// A chord sequence as a piece for two tracks: the chords, whose upper voice stays near the G above
/// middle C and moves as little as it can, and the bass. `tempo` is beats a minute; gaps, undefined
/// chords and symbols without a length are silent.
[[nodiscard]] CMidiPiece MidiPieceOf(MarkovSequenceView sequence, double tempo, int beatsPerBar);

}  // namespace brindle
