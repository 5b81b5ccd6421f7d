// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/ChordGrid.h"

#include <string>
#include <vector>

namespace brindle {

/// Fingerings as strict JSON, see docs/json.md. Strings are counted alike for both hands; the style
/// says for which one they are to be drawn.
[[nodiscard]] std::string GridsJson(const std::vector<CChordGrid>& grids,
                                    const CGridStyle& style = {});

}  // namespace brindle
