// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

/// What stands on the dots of a chord grid.
enum class TGridDots : std::uint8_t {
    Fingers,    ///< 1 index to 4 little finger
    Notes,      ///< "F#"
    Intervals,  ///< degrees as the chord names them, "b3", "9"
};

/// How chord grids are drawn.
struct CGridStyle {
    TGridDots mDots = TGridDots::Fingers;  ///< what is written on them, where there is room
    /// The lowest string stands on the right.
    bool mLeftHanded = false;
};

}  // namespace brindle
