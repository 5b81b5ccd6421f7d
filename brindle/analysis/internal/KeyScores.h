// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/KeyNumbers.h"

#include <array>
#include <span>

namespace brindle {

/// How well the whole song fits each key. `chords` has at least one chord.
[[nodiscard]] std::array<double, kKeyCount> KeyScores(std::span<const CKeyChord> chords);

}  // namespace brindle
