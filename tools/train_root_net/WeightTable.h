// SPDX-License-Identifier: MIT
#pragma once

#include <span>
#include <string>
#include <vector>

namespace brindle::tools {

/// The weights as six digits tell them.
[[nodiscard]] std::vector<double> RoundedToSixDigits(std::span<const double> weights);

/// brindle/neural/weight_definitions.cpp with these weights.
[[nodiscard]] std::string WeightTableText(std::span<const double> weights);

}  // namespace brindle::tools
