// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/ChordGrid.h"

#include <string>
#include <vector>

namespace brindle {

/// Fingerings as strict JSON, see docs/json.md.
[[nodiscard]] std::string GridsJson(const std::vector<CChordGrid>& grids);

}  // namespace brindle
