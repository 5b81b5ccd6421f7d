// SPDX-License-Identifier: MIT
#include "brindle/chords/NameNotes.h"
#include "brindle/chords/internal/NamedChords.h"

#include <algorithm>

namespace brindle {

bool PutRootFirst(std::vector<CNamedChord>& names, int root) {
    const auto isOverRoot = [&](const CNamedChord& name) { return name.mRoot.mKeyNr == root; };
    std::stable_partition(names.begin(), names.end(), isOverRoot);
    return !names.empty() && isOverRoot(names.front());
}

std::vector<CNamedChord> NameNotes(std::span<const CNote> notes, const CNamingOptions& options) {
    const CNamingCandidates candidates(NoteKeysOf(notes), options);
    return NamedChords(candidates.List(), notes, options);
}

}  // namespace brindle
