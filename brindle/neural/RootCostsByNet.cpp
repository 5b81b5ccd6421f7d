// SPDX-License-Identifier: MIT
#include "brindle/neural/RootCostsByNet.h"
#include "brindle/neural/NetForSingleChordAnalysis.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

/// An interval above the lowest note as the inputs have it: those beyond them count an octave
/// lower.
std::size_t InputOf(std::int64_t intvl, std::int64_t inputCount) {
    if (intvl < inputCount) return static_cast<std::size_t>(intvl);
    return static_cast<std::size_t>(inputCount - 12 + (intvl - inputCount) % 12);
}

}  // namespace

std::array<int, 12> RootCostsByNet(std::span<const CNote> notes) {
    constexpr double kLeastOutput = 1e-4;
    std::array<int, 12> costs{};
    std::int64_t lowest = kNoteNrUndef;
    for (const CNote& note : notes) {
        if (note.IsUndef()) continue;
        lowest = lowest == kNoteNrUndef ? note.mNoteNr : std::min(lowest, note.mNoteNr);
    }
    if (lowest == kNoteNrUndef) return costs;

    const std::lock_guard lock(LockOfNetForSingleChordAnalysis());
    NeuronalNet& net = NetForSingleChordAnalysis();
    const int inputCount = net.get_input_neuron_count();
    std::vector<double> inputs(static_cast<std::size_t>(inputCount), 0.0);
    for (const CNote& note : notes) {
        if (!note.IsUndef()) inputs[InputOf(note.mNoteNr - lowest, inputCount)] = 1.0;
    }
    net.use(inputs);
    const std::vector<double> outputs = net.get_outputs();
    for (std::size_t up = 0; up < costs.size() && up < outputs.size(); ++up) {
        const auto root = static_cast<std::size_t>(FoldIntoOctave(lowest + static_cast<int>(up)));
        const double share = std::clamp(outputs[up], kLeastOutput, 1.0);
        costs[root] = static_cast<int>(std::lround(-std::log2(share)));
    }
    return costs;
}

}  // namespace brindle
