// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/MakeSong.h"

#include <vector>

namespace brindle {

/// The passages of a song that repeat earlier ones, by position, with their exact ranges.
[[nodiscard]] std::vector<CShownCopy> MakeSongCopies(const CHarmonicAnalyse& analyse,
                                                     const CChordSymbols& symbols);

}  // namespace brindle
