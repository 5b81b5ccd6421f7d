// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/internal/JumpPlan.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace brindle {

/// A place in the playing order that was reached by a jump back.
struct CJumpBack {
    /// Indexes into the played measures: the copy, and where the same measure was played before.
    std::size_t mTo = 0;
    std::size_t mFrom = 0;
    /// So many measures follow on each other here as they did there.
    std::size_t mLength = 0;
};

/// The measures of a song in the order in which they are played.
struct CPlayingOrder {
    std::vector<std::uint32_t> mMeasures;
    std::vector<CJumpBack> mJumpsBack;
    /// Whether the song was cut, see kMaxTimesPlayed.
    bool mWasCut = false;
};

/// Follows repeats, endings and jumps. A jump is made once, at the end of its measure and after the
/// last pass of a repeat around it. What was played before it is played again without repeats and
/// with the last endings.
[[nodiscard]] CPlayingOrder PlayInOrder(TMarksOfMeasures marks);

}  // namespace brindle
