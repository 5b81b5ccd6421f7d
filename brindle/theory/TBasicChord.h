// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

/// The eight chord skeletons. `CChordHeavy` gives them its own name too: `CChordHeavy::Major`.
enum class TBasicChord : std::int32_t {
    None = 0,
    Major = 1,
    Minor = 2,
    Augmented = 3,
    Diminished = 4,
    Sus4 = 5,
    Sus2 = 6,
    Drone = 7,
};

}  // namespace brindle
