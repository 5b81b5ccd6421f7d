// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/MakeSong.h"

#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/ReadHarmony.h"
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/song/CSong.h"

namespace brindle {

struct CSongAnalysis;

/// Finds the keys of a song and prepares them for the eye, with the numeral of each chord.
[[nodiscard]] CShownKeys MakeSongKeys(const CHarmAnlsChords& chords, const CChordSymbols& symbols,
                                      const CKeyOptions& options,
                                      const CNumeralOptions& numeralOptions = {});

/// Prepares those that were found already.
[[nodiscard]] CShownKeys MakeSongKeys(const CSongAnalysis& found, const CChordSymbols& symbols);

/// Prepares the keys and numerals of a reading for the eye, with what is to be said of keys that
/// contradict each other. It has no points of keys.
[[nodiscard]] CShownKeys MakeSongKeys(const CSong& song, const CSongReading& reading);

}  // namespace brindle
