// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/present/CPaint.h"
#include "brindle/present/ChordGrid.h"

#include <string>
#include <vector>

namespace brindle {

/// The libraries of a database with their tunings and numbers of chords, as a table and as JSON,
/// see docs/json.md.
[[nodiscard]] std::string GridLibrariesText(const GChDatabase& database, const CPaint& paint);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string GridLibrariesJson(const GChDatabase& database);

/// All fingerings of a database, each under the name of its chord.
[[nodiscard]] std::vector<CChordGrid> AllGridsOf(const GChDatabase& database);

}  // namespace brindle
