// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

/// Where a tone outside a set of tones goes: to the closest one, or always up or down.
enum TQuantizeDirection : std::int32_t {
    TQuantizeDirection_ClosestTieRight = 0,  ///< the closest; up if two are as close
    TQuantizeDirection_ClosestTieLeft = 1,   ///< the closest; down if two are as close
    TQuantizeDirection_Right = 2,            ///< always up
    TQuantizeDirection_Left = 3,             ///< always down
};

/// Whether a search beyond B comes back in at C (and the other way) or runs on into the next
/// octave.
enum TWrapAtOctave : std::int32_t {
    TWrapAtOctave_Yes = 0,  ///< C follows B
    TWrapAtOctave_No = 1,   ///< it runs on into the next octave
};

/// To which side semitones move, and whether they stay within the octave.
struct TQuantizeSemitonesOptions {
    /// Which way to go from a tone outside.
    TQuantizeDirection mDirection = TQuantizeDirection_ClosestTieRight;
    TWrapAtOctave mWrapAtOctave = TWrapAtOctave_Yes;  ///< whether the search ends at the octave
};

/// The side taken when two degrees of a scale are equally near. Any value other than 0 is left.
enum TQuantizeToScaleDirection : std::int32_t {
    TQuantizeToScaleDirection_ClosestTieRight = 0,  ///< up
    TQuantizeToScaleDirection_ClosestTieLeft = 1,   ///< down
};

}  // namespace brindle
