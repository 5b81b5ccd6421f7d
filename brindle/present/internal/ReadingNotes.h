// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/present/CBars.h"
#include "brindle/song/CSong.h"

#include <string>
#include <vector>

namespace brindle {

/// What is worth a word in a song: "bars 9 to 12: ii V I of Eb major". In the order in which they
/// first happen; what happens several times is told once, with all places.
[[nodiscard]] std::vector<std::string> ReadingNotes(const CSong& song, const CSongReading& reading,
                                                    const CBars& bars);

/// Where keys contradict: the one that the song states, the one that the chords show when each is
/// counted for itself, and the one of the reading. Empty if all are one.
[[nodiscard]] std::vector<std::string> KeyContradictions(const CSong& song,
                                                         const CSongReading& reading);

}  // namespace brindle
