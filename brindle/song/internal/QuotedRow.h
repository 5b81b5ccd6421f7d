// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSongQuotes.h"
#include "brindle/song/internal/SongStretch.h"

#include <cstddef>
#include <span>
#include <vector>

namespace brindle {

/// A written chord as it sounds, that begins on a beat of the song.
[[nodiscard]] CQuotedChord QuotedChordOf(const CWrittenChord& chord, std::size_t beat,
                                         int beatsPerBar);

/// Chords from a beat of the song on, equal neighbours as one chord.
[[nodiscard]] std::vector<CQuotedChord> QuotedRowOf(std::span<const CWrittenChord> chords,
                                                    std::size_t beat, int beatsPerBar);

}  // namespace brindle
