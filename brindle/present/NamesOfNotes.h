// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CNote.h"

#include <nlohmann/json_fwd.hpp>
#include <span>
#include <string>

namespace brindle {

/// "C4 Eb4 G4", each with the octave of its letter: note 60 is C4 or B#3.
[[nodiscard]] std::string NamesOfNotes(std::span<const CNote> notes, const CChordNamePrefs& prefs);

/// A list of names and numbers.
[[nodiscard]] nlohmann::ordered_json NotesToJson(std::span<const CNote> notes,
                                                 const CChordNamePrefs& prefs);

}  // namespace brindle
