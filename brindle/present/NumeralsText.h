// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadNumerals.h"

#include <string>
#include <vector>

namespace brindle {

/// The lines of words as they were typed, each turned into the symbol of its chord (`toChords`) or
/// into its numeral in the key. Marks and what is not understood stay.
[[nodiscard]] std::string NumeralWordsText(const std::vector<CNumeralWord>& words,
                                           const CSignKeyLite& key, bool toChords,
                                           const CNumeralOptions& options = {});

}  // namespace brindle
