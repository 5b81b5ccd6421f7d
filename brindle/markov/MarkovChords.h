// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovObject.h"

#include <string_view>
#include <vector>

namespace brindle {

using CHarmAnlsChordsWithLength = std::vector<CHarmAnlsChordWithLength>;

/// Reads a sequence of chords with their lengths in beats, such as `(4,C);(2,U);(2,G7)`; "U" is an
/// undefined chord. Roots and basses stand for their own distance from C. What cannot be read
/// becomes an undefined chord or a length of 0.
[[nodiscard]] CHarmAnlsChordsWithLength HarmChordsFromChordString(std::string_view text);

/// Whether neither the root nor the bass has a distance from the center.
[[nodiscard]] bool IsUndefinedForMarkov(const CHarmAnlsChordWithLength& chord);

/// Appends the symbol of each chord: a gap of its length for an undefined one.
void MarkovObjectsVectorForHarmChords(const CHarmAnlsChordsWithLength& chords,
                                      std::vector<CMarkovObject>& out);

// Notes, to hear the chords. `relative` takes the distances from the center instead of the keys, as
// if all were in C.

/// The tones of the chord from the C below middle C up, or one octave more.
void CHarmAnlsChordWithLengthToMidiNotes(const CHarmAnlsChordWithLength& chord,
                                         std::vector<unsigned char>& out, bool relative);

/// Appends the bass, or the root where there is none, about an octave below the notes, but not
/// below note 40, a low E.
void AddBassNoteToMidiNotes(const CHarmAnlsChordWithLength& chord,
                            std::vector<unsigned char>& notes, bool relative);

/// Simple voice leading: turns over the chord so that its highest note comes near to `center`: the
/// upper voice of successive chords then moves little. Sorts the notes.
void TransposeChordBasedOnPreviousChords(std::vector<unsigned char>& notes, int center);

}  // namespace brindle
