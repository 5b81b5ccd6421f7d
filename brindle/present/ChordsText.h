// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/present/CPaint.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <optional>
#include <string>
#include <vector>

namespace brindle {

/// A chord and the symbol that it was read from.
struct CReadChord {
    std::string mSymbol;  ///< as somebody wrote it
    CChordLite mChord;    ///< undefined for a text that is no chord
};

/// Root, bass, tones and hash code of chords, as a table and as JSON, see docs/json.md. With a
/// style their names stand there, too, written in it, and the table has root and bass in it.
[[nodiscard]] std::string ChordsText(const std::vector<CReadChord>& chords, const CPaint& paint,
                                     const std::optional<CChordNamePrefs>& style = {});
/// The same as JSON.
[[nodiscard]] std::string ChordsJson(const std::vector<CReadChord>& chords,
                                     const std::optional<CChordNamePrefs>& style = {});

}  // namespace brindle
