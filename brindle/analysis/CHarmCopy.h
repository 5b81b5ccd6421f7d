// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/Positions.h"

#include <cstdint>
#include <iosfwd>
#include <utility>
#include <vector>

namespace brindle {

/// A passage that repeats an earlier one, chord for chord.
struct CHarmCopy {
    /// Where the copy starts, in beats.
    double mTargetPos = kPosUndef;
    /// From the copy back to its source, in bars: negative.
    std::int32_t mSourceOffsetBars = 0;
    std::uint64_t mLengthBars = 0;  ///< in whole bars of four beats, what is left over is cut off
    /// Always 0.
    std::uint64_t mChords = 0;

    friend constexpr bool operator==(const CHarmCopy&, const CHarmCopy&) = default;
};

/// Writes all fields on one line, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmCopy& copy);

/// Copies by position, as CHarmonicAnalyse::FindHarmCopies gives them.
using CHarmCopies = std::vector<CHarmCopy>;

/// The places in a chord list where a sequence of chords starts, ascending, and how many chords it
/// has.
using THarmRepeatingSequence = std::pair<std::vector<std::uint64_t>, std::uint64_t>;
/// Sorted by their places, then by the number of chords.
using THarmRepeatingSequences = std::vector<THarmRepeatingSequence>;

}  // namespace brindle
