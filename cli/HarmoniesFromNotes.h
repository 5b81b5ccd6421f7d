// SPDX-License-Identifier: MIT
#pragma once

#include "cli/LeadSheet.h"
#include "cli/Output.h"

#include "brindle/musicxml/ChordsFromNotes.h"

namespace brindle::cli {

/// Prints the chords that the notes of a score make, as a table or as JSON.
TStatus PrintChordsFromNotes(const CTypedSong& song, const CChordsFromNotesOptions& options,
                             bool isJson);

}  // namespace brindle::cli
