// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/present/ShownSong.h"
#include "brindle/song/CSong.h"

#include <string>
#include <vector>

namespace brindle {

/// The passages of whole bars that repeat earlier ones, as lines "bars 13 to 21 repeat bars 1 to
/// 9": the longest, without overlaps. A single bar counts if it has several chords.
[[nodiscard]] std::string RepeatsText(const CSong& song, const CPaint& paint);

/// The copies of a song and behind them those passages as JSON, see docs/json.md.
[[nodiscard]] std::string CopiesJson(const std::vector<CShownCopy>& copies, const CSong& song);

}  // namespace brindle
