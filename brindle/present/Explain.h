// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/present/CPaint.h"
#include "brindle/song/CSong.h"

#include <string>
#include <vector>

namespace brindle {

/// Tells of each chord in a sentence what it does: "E7 is the dominant of A minor, which follows."
/// Empty for what is no chord. `reading` is that of the chords of the song. Linear in the chords.
///
/// The sentences are in the language of the user, as LocalizedString finds them. Chords are named
/// as the song writes them, keys as the language does: "h-Moll", "si mineur".
[[nodiscard]] std::vector<std::string> Explain(const CSong& song, const CSongReading& reading);

/// The sentences as a paragraph, each behind its bar; what is said of the same chord twice in a row
/// once. Empty without sentences.
[[nodiscard]] std::string ExplanationsText(const CSong& song,
                                           const std::vector<std::string>& sentences,
                                           const CPaint& paint);

}  // namespace brindle
