// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"

namespace brindle {

struct CSong;
struct TMusicXMLDoc;

// The times of a score that was read as TMusicXMLDoc, in quarter notes.

/// Whether every chord has a place in time; a score read by LoadFromMusicXMLFile may have others.
[[nodiscard]] bool HasTimes(const TMusicXMLDoc& sheet);
/// The same for a song; one that lasts longer than anybody plays has none.
[[nodiscard]] bool HasTimes(const CSong& song);

/// What a song tells beside its chords, as a score tells it: title, times, sections, copies, bars.
[[nodiscard]] TMusicXMLDoc SheetWithoutChords(const CSong& song);

/// Where the last chord ends.
[[nodiscard]] double EndOf(const TMusicXMLDoc& sheet);

/// `chords`, which an analysis read from the score, in the form that a chord text gives: with an
/// undefined chord where no chord sounds, and one at the end.
[[nodiscard]] CHarmAnlsChords WithRests(const CHarmAnlsChords& chords, const TMusicXMLDoc& sheet);

/// The length of the bars of a score by its first time signature; without one, that of most bars.
[[nodiscard]] double BeatsPerBarOf(const TMusicXMLDoc& sheet);

}  // namespace brindle
