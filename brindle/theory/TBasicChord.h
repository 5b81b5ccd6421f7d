// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

/// The eight chord skeletons. `CChordHeavy` gives them its own name too: `CChordHeavy::Major`.
enum class TBasicChord : std::int32_t {
    None = 0,        ///< no skeleton
    Major = 1,       ///< 0 4 7
    Minor = 2,       ///< 0 3 7
    Augmented = 3,   ///< 0 4 8
    Diminished = 4,  ///< 0 3 6
    Sus4 = 5,        ///< 0 5 7
    Sus2 = 6,        ///< 0 2 7
    Drone = 7,       ///< 0 7, a bare fifth
};

}  // namespace brindle
