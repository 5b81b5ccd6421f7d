// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/musicxml/internal/PlayingOrder.h"
#include "brindle/musicxml/internal/WrittenScore.h"
#include "brindle/platform/Error.h"

#include <cstddef>
#include <optional>
#include <string_view>

namespace brindle {

/// Of the errors of loading a score as it is played.
inline constexpr std::string_view kLoadFaultDomain = "brindle.musicxml";
enum TLoadFault : int {
    LoadFault_File = 1,
    LoadFault_Container = 2,
    LoadFault_Score = 3,
    LoadFault_Endless = 4,
};

/// Why there is no score, or not all of it.
struct CScoreFault {
    Error mError;
    /// From 1; 0 where the fault has no place in a text.
    std::size_t mLine = 0;
    std::size_t mColumn = 0;
};

/// A score as it is written and as it is played.
struct CPlayedScore {
    CWrittenScore mWritten;
    CPlayingOrder mOrder;
    TMusicXMLDoc mDoc;
    /// In quarters.
    double mEnd = 0.0;
    std::optional<CScoreFault> mFault;
};

/// Reads a score, plain or in a container, and plays it.
[[nodiscard]] CPlayedScore PlayScoreBytes(std::string_view bytes);

/// Plays `score.mWritten` into its other fields. False when the song was cut, see kMaxTimesPlayed.
bool LayOutAsPlayed(CPlayedScore& score);

}  // namespace brindle
