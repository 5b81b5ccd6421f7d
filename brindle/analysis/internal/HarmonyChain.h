// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/KeyChordKinds.h"

#include <cstddef>
#include <span>
#include <vector>

namespace brindle {

/// The later chord that each chord stands under, -1 for none: the tree of a song, whose arcs never
/// cross. `home` is the key of the song.
[[nodiscard]] std::vector<std::ptrdiff_t> HarmonyChain(std::span<const CKeyChord> chords,
                                                       std::span<const TKeyChordKind> kinds,
                                                       int home);

}  // namespace brindle
