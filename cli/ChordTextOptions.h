// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>

namespace brindle::cli {

class CCommand;

/// Adds --beats-per-bar and --beats-per-chord.
void AddBeats(CCommand& command, double& beatsPerBar, double& beatsPerChord);

/// What is wrong with the values of these.
[[nodiscard]] std::optional<std::string> BeatsContradiction(double beatsPerBar,
                                                            double beatsPerChord);

}  // namespace brindle::cli
