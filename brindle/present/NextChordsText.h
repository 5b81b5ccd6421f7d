// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/song/NextChords.h"

#include <string>

namespace brindle {

/// The key and the chords that may come next, as a table and as JSON, see docs/json.md.
[[nodiscard]] std::string NextChordsText(const CNextChords& next, const CPaint& paint);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string NextChordsJson(const CNextChords& next);

}  // namespace brindle
