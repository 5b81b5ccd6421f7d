// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/song/ScoreSongs.h"

#include <cstddef>
#include <span>
#include <string>

namespace brindle {

/// How well so many songs are foretold by histories of each length, as ScoresByOrder gives it:
/// bits per chord with and without keys, as a table and as JSON, see docs/json.md. There must be a
/// score.
[[nodiscard]] std::string SongScoresText(std::span<const COrderScores> scores, std::size_t songs,
                                         const CPaint& paint);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string SongScoresJson(std::span<const COrderScores> scores, std::size_t songs);

}  // namespace brindle
