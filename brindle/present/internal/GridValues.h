// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChChordElem.h"
#include "brindle/present/ChordGrid.h"
#include "brindle/present/JsonValues.h"

#include <vector>

namespace brindle {

// What the JSON of a fingering and that of a package of them share.

/// Null for no key, which is negative.
[[nodiscard]] Json KeyNrToJson(int keyNr);

/// Frets count from 1, fingers too; finger 0 is none.
[[nodiscard]] Json ElemsToJson(const std::vector<GChChordElem>& elems);

/// A grid with all that is known of it.
[[nodiscard]] Json GridToJson(const CChordGrid& grid);

}  // namespace brindle
