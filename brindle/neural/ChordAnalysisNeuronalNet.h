// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/neural/NetProperties.h"

#include <array>

namespace brindle {

/// Weights of the net below, in the order of NeuronalNet::get_weights, with six digits. They are
/// made by tools/train_root_net.
extern const std::array<double, 765> weight_definitions;

/// The net that hears the root of a single chord.
///
/// 24 inputs: i is 1.0 if the chord has a note i semitones above its lowest note, counted modulo
/// 24, else 0.0. Input 0 is always 1.0.
/// 12 outputs: the greatest is the one of j, if the root is j semitones above the lowest note.
extern const TPredefinedWeights ChordAnalysisNeuronalNet;

}  // namespace brindle
