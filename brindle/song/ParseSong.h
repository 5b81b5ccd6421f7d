// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSong.h"

#include <string_view>

namespace brindle {

struct TChordStringParse;

/// A chord text as CHarmAnlsChords::ParseStringIntoChords reads it, for those who need what hosts
/// of that get: no repeats, bars or stated keys, and no faults, since it passes over what it does
/// not know. The signs U+266F and U+266D are read as # and b. ReadSong reads all spellings.
[[nodiscard]] CSong ParseSong(std::string_view text, const TChordStringParse& parse);

}  // namespace brindle
