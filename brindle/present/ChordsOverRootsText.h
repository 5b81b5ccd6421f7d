// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/neural/NameOverRoots.h"
#include "brindle/present/CPaint.h"

#include <span>
#include <string>
#include <vector>

namespace brindle {

/// Notes and their names over roots, the best first; there is at least one.
struct CNotesOverRoots {
    std::vector<CNote> mNotes;           ///< from low to high
    std::vector<CChordOverRoot> mNames;  ///< one for each root that was looked at
};

/// Notes with their names, as a table in which a root that does not sound stands in brackets.
[[nodiscard]] std::string ChordsOverRootsText(std::span<const CNotesOverRoots> chords,
                                              const CChordNamePrefs& prefs, const CPaint& paint);

/// The same as JSON, see docs/json.md; with `allRoots` all names of each chord behind the first.
/// Notes have their names in ASCII; of `prefs` only the octave of middle C counts.
[[nodiscard]] std::string ChordsOverRootsJson(std::span<const CNotesOverRoots> chords,
                                              const CChordNamePrefs& prefs, bool allRoots);

}  // namespace brindle
