// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/internal/KeyChords.h"

#include <cstdint>
#include <span>
#include <vector>

namespace brindle {

// A key is a number here: the tonic for major, the tonic + 12 for minor.
inline constexpr int kKeyCount = 24;

[[nodiscard]] constexpr int ModeOfKey(int key) {
    return key / 12;
}
[[nodiscard]] constexpr int TonicOfKey(int key) {
    return key % 12;
}

/// How well the whole song fits each key. `chords` has at least one chord.
[[nodiscard]] std::array<double, kKeyCount> KeyScores(std::span<const TKeyChord> chords);

/// The key of each chord, on the best path through the keys. `home` is the key of the song.
[[nodiscard]] std::vector<std::uint8_t> LocalKeys(std::span<const TKeyChord> chords, int home,
                                                  const CKeyOptions& options);

}  // namespace brindle
