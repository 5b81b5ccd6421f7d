// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/song/CSong.h"

namespace brindle {

/// Reads the harmony of a song in the key that it states, if the options have none; with the beats
/// of its bars. A score states a signature, whose mode is often wrong: it counts only if the chords
/// show the same key.
[[nodiscard]] CSongReading ReadSongHarmony(const CSong& song, CReadingOptions options = {});

}  // namespace brindle
