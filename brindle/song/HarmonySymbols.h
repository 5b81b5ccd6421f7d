// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/musicxml/TMusicXMLHarmony.h"

#include <string>

namespace brindle {

/// The chord of a harmony; undefined where it has no root.
[[nodiscard]] CChordLite ChordOfHarmony(const TMusicXMLHarmony& harmony);

/// The chord symbol of a harmony as a lead sheet prints it, in a form that reads back as the same
/// chord where there is one: "F#m7b5/C", "N.C."; "?" for what is no chord.
[[nodiscard]] std::string HarmonySymbol(const TMusicXMLHarmony& harmony);

}  // namespace brindle
