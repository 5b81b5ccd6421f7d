// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Bars.h"
#include "cli/Output.h"
#include "cli/Song.h"

#include <string>

namespace brindle::cli {

// The presentations of the keys of a song.

/// For people: the key of the song, and under it its regions with their chords.
[[nodiscard]] std::string KeysText(const TSong& song, const CPaint& paint);

/// The same in a few lines, one for each region; empty for a song without a key.
[[nodiscard]] std::string KeysSummary(const TSongKeys& keys, const CBars& bars,
                                      const CPaint& paint);

/// A picture: the song as a ribbon of regions, with the chords and their numerals under it.
[[nodiscard]] std::string KeysSvg(const TSong& song);

}  // namespace brindle::cli
