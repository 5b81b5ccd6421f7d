// SPDX-License-Identifier: MIT
#include "brindle/neural/NetForSingleChordAnalysis.h"

#include "brindle/neural/ChordAnalysisNeuronalNet.h"

namespace brindle {

NeuronalNet& NetForSingleChordAnalysis() {
    static NeuronalNet net(ChordAnalysisNeuronalNet);
    return net;
}

std::mutex& LockOfNetForSingleChordAnalysis() {
    static constinit std::mutex lock;
    return lock;
}

namespace {

// Made at load, not at first use: building it later would take the calculation parameters away
// from a net that the host has built.
[[maybe_unused]] const NeuronalNet& kMadeAtLoad = NetForSingleChordAnalysis();

}  // namespace

}  // namespace brindle
