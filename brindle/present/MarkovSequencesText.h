// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/DrawMarkovSequences.h"
#include "brindle/present/CPaint.h"
#include "brindle/present/MarkovText.h"

#include <cstddef>
#include <nlohmann/json_fwd.hpp>
#include <string>

namespace brindle {

/// Length, symbol, root, bass and semitones of a chord; its type for any other symbol.
[[nodiscard]] nlohmann::ordered_json MarkovSymbolToJson(const CMarkovObject& object,
                                                        const CMarkovSpelling& spelling);

/// The sequence that was chosen as a chord text in bars, and behind it `others` of the others with
/// their weights. There must be a sequence.
[[nodiscard]] std::string DrawnSequencesText(const CMarkovDraws& draws, int beatsPerBar,
                                             std::size_t others, const CPaint& paint);

/// All that was drawn as JSON, see docs/json.md.
[[nodiscard]] std::string DrawnSequencesJson(const CMarkovDraws& draws);

/// A sequence whose gaps were filled, and the one that was typed, as JSON, see docs/json.md.
[[nodiscard]] std::string FilledSequenceJson(MarkovSequenceView filled, MarkovSequenceView typed);

}  // namespace brindle
