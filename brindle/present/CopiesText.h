// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/present/ShownSong.h"

#include <string>
#include <vector>

namespace brindle {

/// The repeated passages of a song as a table, with bars of one length.
[[nodiscard]] std::string CopiesText(const std::vector<CShownCopy>& copies, double beatsPerBar,
                                     const CPaint& paint);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string CopiesJson(const std::vector<CShownCopy>& copies);

}  // namespace brindle
