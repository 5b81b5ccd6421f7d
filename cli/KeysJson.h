// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Json.h"
#include "cli/Song.h"

namespace brindle::cli {

/// Adds the members for the key of the song and for its regions, see docs/json.md.
void AppendKeysJson(Json& json, const TSongKeys& keys);

/// The points of the 24 keys by name.
[[nodiscard]] Json KeyScoresJson(const TSongKeys& keys);

}  // namespace brindle::cli
