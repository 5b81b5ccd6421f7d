// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/ImportedScore.h"
#include "brindle/present/MidiFile.h"

namespace brindle {

/// An imported score as a piece with one track for each part. Notes of unknown length are left out.
/// A note without a pitch has the note number that MIDI gives its instrument, else that of its
/// place on the staff, else that of a snare drum.
[[nodiscard]] CMidiPiece MidiPieceOf(const CImportedScore& score);

}  // namespace brindle
