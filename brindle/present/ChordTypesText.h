// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordTypes.h"
#include "brindle/present/CPaint.h"

#include <string>

namespace brindle {

/// Chord types with their ids, intervals and the name on C, as a table and as JSON, see
/// docs/json.md.
[[nodiscard]] std::string ChordTypesText(const CChordTypeVec& types, const CPaint& paint);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string ChordTypesJson(const CChordTypeVec& types);

}  // namespace brindle
