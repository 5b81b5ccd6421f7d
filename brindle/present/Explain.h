// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/song/CSong.h"

#include <cstddef>
#include <string>
#include <vector>

namespace brindle {

/// Tells of each chord in a sentence what it does: "E7 is the dominant of A minor, which follows."
/// Empty for what is no chord. `reading` is that of the chords of the song. Linear in the chords.
///
/// The sentences are in the language of the user, as LocalizedString finds them. Chords are named
/// as the song writes them, keys as the language does: "h-Moll", "si mineur".
[[nodiscard]] std::vector<std::string> Explain(const CSong& song, const CSongReading& reading);

}  // namespace brindle
