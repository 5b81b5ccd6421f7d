// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/internal/FingeringSearch.h"

namespace brindle {

/// The place of a fingering in the order of a player, less being better. `effort` is that
/// of the hand.
[[nodiscard]] int CostOfFingering(const CFingering& fingering, const CFingeringTask& task,
                                  int effort);

}  // namespace brindle
