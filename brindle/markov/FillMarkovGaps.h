// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/VariableLengthMarkovModel.h"

#include <optional>

namespace brindle {

/// Draws a chord for each gap of a sequence by how well it bridges its neighbours, one as long as
/// the gap where the model comes upon it. Where the histories of the model's length know none,
/// shorter ones are asked, for all gaps again; the model then has that length. Nothing if no length
/// knows a chord. The random source of the model draws.
[[nodiscard]] std::optional<MarkovSequence> FillMarkovGaps(VariableLengthMarkovModel& model,
                                                           const MarkovSequence& sequence);

}  // namespace brindle
