// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/ChordsFromNotes.h"
#include "brindle/present/CPaint.h"

#include <string>

namespace brindle {

struct TMusicXMLDoc;

/// The harmonies of a score as a table. Bars are told if the score was read with bar lines.
[[nodiscard]] std::string HarmoniesText(const TMusicXMLDoc& sheet, const CPaint& paint);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string HarmoniesJson(const TMusicXMLDoc& sheet);

/// The chords that the notes of a score make, as a table behind the key.
[[nodiscard]] std::string ChordsFromNotesText(const CScoreNotes& score,
                                              const CChordsFromNotes& chords, const CPaint& paint);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string ChordsFromNotesJson(const CChordsFromNotes& chords);

}  // namespace brindle
