// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/MarkovChords.h"
#include "brindle/song/CSong.h"

#include <cstddef>
#include <vector>

namespace brindle {

class VariableLengthMarkovModel;

/// The chords of a song with their lengths in beats, rounded to two digits as model files hold
/// them, cut where no chord sounds and where a line of chord strings ends. Chords whose length is
/// no number above 0 are left out.
[[nodiscard]] std::vector<CHarmAnlsChordsWithLength> ChordSequencesOf(const CSong& song);

/// Whether a chord has a length that is no number, as chord strings may tell; such a song is hardly
/// one to learn from.
[[nodiscard]] bool HasEndlessChord(const CSong& song);

/// Learns one sequence.
void LearnChords(VariableLengthMarkovModel& model, const CHarmAnlsChordsWithLength& chords);

/// Learns each sequence of a song. The number of chords that were learned.
std::size_t LearnSong(VariableLengthMarkovModel& model, const CSong& song);

}  // namespace brindle
