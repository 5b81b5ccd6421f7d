// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/NameNotes.h"
#include "brindle/present/CPaint.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <cstddef>
#include <span>
#include <string>
#include <vector>

namespace brindle {

/// How the names of notes are written.
struct CNamedChordStyle {
    /// Of symbols and notes.
    CChordNamePrefs mPrefs = ChordNamePrefsNonUTF8;
    /// Whether a symbol tells all that is left out.
    bool mIsExact = false;
};

/// The names of sets of notes, as NameNotes and NameProgression give them, as a table: at most
/// `count` names of each set.
[[nodiscard]] std::string NamedChordsText(std::span<const std::vector<CNamedChord>> sets,
                                          std::size_t count, const CNamedChordStyle& style,
                                          const CPaint& paint);

/// All of them as JSON, see docs/json.md; sets without a name are left out. Notes and keys have
/// their names in ASCII, in whatever style the symbols are.
[[nodiscard]] std::string NamedChordsJson(std::span<const std::vector<CNamedChord>> sets,
                                          const CNamedChordStyle& style);

}  // namespace brindle
