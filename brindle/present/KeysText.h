// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CBars.h"
#include "brindle/present/CPaint.h"
#include "brindle/present/ShownSong.h"

#include <string>

namespace brindle {

/// The keys of a song for people: the key of the song, and under it its regions with their chords.
[[nodiscard]] std::string KeysText(const CShownSong& song, const CPaint& paint);

/// The same in a few lines, one for each region; empty for a song without a key.
[[nodiscard]] std::string KeysSummary(const CShownKeys& keys, const CBars& bars,
                                      const CPaint& paint);

}  // namespace brindle
