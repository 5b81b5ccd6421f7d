// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/present/ChordGrid.h"

#include <string>
#include <vector>

namespace brindle {

/// Diagrams side by side, in lines of at most about 80 characters.
[[nodiscard]] std::string GridsText(const std::vector<CChordGrid>& grids, const CPaint& paint,
                                    const CGridStyle& style = {});

}  // namespace brindle
