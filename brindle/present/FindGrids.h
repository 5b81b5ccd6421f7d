// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/present/ChordGrid.h"

#include <string_view>
#include <vector>

namespace brindle {

/// The fingerings that sound a chord under a capodaster, in the order of the database. A bass
/// behind a slash is only found where a library tells it.
[[nodiscard]] std::vector<CChordGrid> FindGrids(const GChDatabase& database,
                                                std::string_view symbol, const CChordLite& chord,
                                                const GChShortTuning& tuning, int capo);

}  // namespace brindle
