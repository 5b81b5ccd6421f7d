// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/MarkovContinuations.h"
#include "brindle/present/CPaint.h"

#include <span>
#include <string>

namespace brindle {

/// What a model has learned: its size, how sure it is behind histories of each length, and what
/// follows one history, of which MarkovContinuations tells the continuations. Tables.
[[nodiscard]] std::string MarkovModelText(const VariableLengthMarkovModel& model,
                                          MarkovSequenceView history,
                                          std::span<const CMarkovContinuation> continuations,
                                          const CPaint& paint);

/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string MarkovModelJson(const VariableLengthMarkovModel& model,
                                          MarkovSequenceView history,
                                          std::span<const CMarkovContinuation> continuations);

}  // namespace brindle
