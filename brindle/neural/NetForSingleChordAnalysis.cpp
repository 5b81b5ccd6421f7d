// SPDX-License-Identifier: MIT
#include "brindle/neural/NetForSingleChordAnalysis.h"

#include "brindle/neural/ChordAnalysisNeuronalNet.h"

#include <new>

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

bool MakeNet() noexcept {
    try {
        (void)NetForSingleChordAnalysis();
    } catch (const std::bad_alloc&) {
        return false;  // no reason to end a host before its main: the first use makes it
    }
    return true;
}

// Made at load, not at first use: building it later would take the calculation parameters away
// from a net that the host has built.
[[maybe_unused]] const bool kIsMadeAtLoad = MakeNet();

}  // namespace

}  // namespace brindle
