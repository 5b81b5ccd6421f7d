// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/WriteSong.h"
#include "brindle/song/internal/SongForm.h"
#include "brindle/song/internal/SongStretch.h"

#include <cstddef>
#include <string>
#include <vector>

namespace brindle {

/// A stretch of a song, and the part that it belongs to.
struct CPlannedStretch {
    std::size_t mPart = 0;
    CSongStretch mStretch;
};

/// What is to be written for a form and wishes: the parts that are new, whole, and the endings of
/// those that only end anew.
struct CSongPlan {
    std::vector<CFormPart> mParts;
    std::vector<CPlannedStretch> mStretches;
    /// Whether a stretch was found for each row of chords that is to be contained.
    bool mHasRoomForRows = true;
};

/// The longest quote that is allowed, in ticks; 0 for any.
[[nodiscard]] std::int32_t MostQuotedTicks(const CWriteSongOptions& options);

/// `wishes` are indices of the wishes of the options that count.
[[nodiscard]] CSongPlan PlanSong(const CSongModel& model, const CWriteSongOptions& options,
                                 const std::vector<std::size_t>& wishes);

/// A smallest set of wishes that cannot be met together, as indices; empty if all can be met.
[[nodiscard]] std::vector<std::size_t> ContradictingWishes(const CSongModel& model,
                                                           const CWriteSongOptions& options);

}  // namespace brindle
