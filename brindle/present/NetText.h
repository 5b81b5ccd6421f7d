// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/neural/NeuronalNet.h"

#include <string>

namespace brindle {

/// The shape of a net and the properties of its neurons, as text and as JSON, see docs/json.md.
[[nodiscard]] std::string NetText(const NeuronalNet& net);
/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string NetJson(const NeuronalNet& net);

// A report on a net that hears the roots of chords: what it gets wrong of all voicings that
// ChordRootPatterns has, and its weights. It must have their inputs and an output for each root.

/// With the weights in a form that can be loaded.
[[nodiscard]] std::string NetWeightsText(NeuronalNet net);
/// See docs/json.md.
[[nodiscard]] std::string NetWeightsJson(NeuronalNet net);

}  // namespace brindle
