// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/present/CPaint.h"

#include <string>
#include <vector>

namespace brindle {

/// A chord and the symbol that it was read from.
struct CReadChord {
    std::string mSymbol;  ///< as somebody wrote it
    CChordLite mChord;    ///< undefined for a text that is no chord
};

/// Root, bass, tones and hash code of chords, as a table and as JSON, see docs/json.md.
[[nodiscard]] std::string ChordsText(const std::vector<CReadChord>& chords, const CPaint& paint);
/// The same as JSON.
[[nodiscard]] std::string ChordsJson(const std::vector<CReadChord>& chords);

}  // namespace brindle
