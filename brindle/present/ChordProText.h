// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSong.h"

#include <string>

namespace brindle {

/// The song in ChordPro: title, makers, style, key, tempo and time as directives, its sections as
/// comments, and its chords as a grid, four bars a line, as they are played. A beat in which the
/// chord before goes on is a point. Words of the song are not kept in a CSong and so are not
/// written. A song of more than a million steps has none.
///
/// ReadSong reads the same chords at the same places back where all chords begin on whole beats;
/// others begin on the beat before.
[[nodiscard]] std::string ChordProText(const CSong& song);

}  // namespace brindle
