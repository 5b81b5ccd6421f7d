// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Song.h"

#include <vector>

namespace brindle::cli {

/// The passages of a song that repeat earlier ones, by position, with their exact ranges.
[[nodiscard]] std::vector<CShownCopy> MakeSongCopies(const CHarmonicAnalyse& analyse,
                                                     const CChordSymbols& symbols);

}  // namespace brindle::cli
