// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/song/CSongModel.h"

#include <string>

namespace brindle {

/// The songs that a model was made of as a table, with the makers of those that are built in, and
/// how many there are of each style.
[[nodiscard]] std::string ModelSongsText(const CSongModel& model, const CPaint& paint);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string ModelSongsJson(const CSongModel& model);

}  // namespace brindle
