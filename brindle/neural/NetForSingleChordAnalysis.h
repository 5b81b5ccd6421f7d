// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/neural/NeuronalNet.h"

#include <mutex>

namespace brindle {

/// The one net that hears the roots of chords, made of ChordAnalysisNeuronalNet when the program
/// is loaded. Its weights never change.
///
/// Threads: hold the lock below while using it. The calculation parameters of Neuron, which every
/// net shares, are not behind that lock: no net may be built or trained while a root is searched,
/// and a net with other parameters that was built since load changes what this one hears.
[[nodiscard]] NeuronalNet& NetForSingleChordAnalysis();

/// Guards NetForSingleChordAnalysis.
[[nodiscard]] std::mutex& LockOfNetForSingleChordAnalysis();

}  // namespace brindle
