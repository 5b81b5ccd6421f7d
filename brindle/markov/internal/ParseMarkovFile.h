// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/internal/CMarkovFileTransitions.h"

#include <nlohmann/json_fwd.hpp>
#include <string>

namespace brindle {

inline constexpr const char* kMarkovModelKey = "VariableLengthMarkovModel";
inline constexpr const char* kMarkovTransitionsKey = "TransitionMap";

/// Parses the text of a model file. The entries of its transition map go into `transitions` one by
/// one, so that only their numbers are kept. Null if the text is no JSON.
[[nodiscard]] nlohmann::json ParseMarkovFile(const std::string& text,
                                             CMarkovFileTransitions& transitions);

}  // namespace brindle
