// SPDX-License-Identifier: MIT
#include "brindle/chords/NameNotes.h"
#include "brindle/chords/internal/NamedChords.h"

namespace brindle {

std::vector<CNamedChord> NameNotes(std::span<const CNote> notes, const CNamingOptions& options) {
    const CNamingCandidates candidates(NoteKeysOf(notes), options);
    return NamedChords(candidates.List(), notes, options);
}

}  // namespace brindle
