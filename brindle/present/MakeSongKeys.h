// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/MakeSong.h"

#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/RomanNumeral.h"

namespace brindle {

/// Finds the keys of a song and prepares them for the eye, with the numeral of each chord.
[[nodiscard]] CShownKeys MakeSongKeys(const CHarmAnlsChords& chords, const CChordSymbols& symbols,
                                      const CKeyOptions& options,
                                      const CNumeralOptions& numeralOptions = {});

}  // namespace brindle
