// SPDX-License-Identifier: MIT
#pragma once

#include "cli/TypedSongs.h"

#include "brindle/musicxml/ChordsFromNotes.h"

namespace brindle::cli {

/// The chords that the notes of a score make, as a table or as JSON.
[[nodiscard]] TSongOutput ShowChordsFromNotes(const CTypedSong& song,
                                              const CChordsFromNotesOptions& options, bool isJson);

}  // namespace brindle::cli
