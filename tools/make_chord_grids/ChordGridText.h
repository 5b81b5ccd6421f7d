// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChTuning.h"

#include <memory>
#include <string>
#include <string_view>

namespace brindle::tools {

/// Reads the text of data/chord-grids.txt into the libraries of a standard guitar. Null when a line
/// is wrong; `fault` tells which and why.
[[nodiscard]] std::shared_ptr<GChTuning> ReadChordGrids(std::string_view text, std::string& fault);

}  // namespace brindle::tools
