// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/internal/KeyChordKinds.h"
#include "brindle/analysis/internal/SongTraits.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

namespace brindle {

/// The key of each chord, on the best path through the keys.
[[nodiscard]] std::vector<std::uint8_t> LocalKeys(std::span<const CKeyChord> chords,
                                                  std::span<const TKeyChordKind> kinds,
                                                  const CSongTraits& traits,
                                                  const CKeyOptions& options);

/// The number of passages that are in one key each; a modulation leads
/// from one to the next.
[[nodiscard]] std::size_t CountRuns(std::span<const std::uint8_t> keys);

/// Gives short passages and the ends of passages to the key around them, where their chords are at
/// home there: a tonicization of the second degree, a borrowed chord behind a cadence.
void TidyLocalKeys(std::span<const CKeyChord> chords, int home, std::vector<std::uint8_t>& keys);

}  // namespace brindle
