// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/song/CSong.h"

#include <cstdint>
#include <string>
#include <vector>

namespace brindle {

/// What stands for the chords of a song.
enum TSongNaming : std::uint8_t {
    TSongNaming_Symbols,    ///< chord symbols in a style
    TSongNaming_Nashville,  ///< numbers in the key of each passage: 2-7 57 1
    TSongNaming_Roman,      ///< numerals in it, as the reading has them: ii7 V7 I
};

/// A name for each chord of a song, the end left out. `reading` is that of its chords. What sounds
/// no chord keeps its symbol. Of the style, symbols alone take the names of notes.
[[nodiscard]] std::vector<std::string> SongSymbols(const CSong& song, const CSongReading& reading,
                                                   TSongNaming naming,
                                                   const CChordSymbolStyle& style = {});

}  // namespace brindle
