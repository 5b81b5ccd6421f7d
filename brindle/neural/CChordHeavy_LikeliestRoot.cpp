// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"
#include "brindle/neural/NetForSingleChordAnalysis.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {

namespace {

/// Which intervals above its root a chord has: 1.0 for each that it has, else 0.0.
std::vector<double> NetInputsOf(const CChordHeavy& chord, int inputCount) {
    std::vector<double> inputs(static_cast<std::size_t>(inputCount), 0.0);
    for (const int intvl : chord.IntvlSet()) {
        if (intvl >= 0 && intvl < inputCount) inputs[static_cast<std::size_t>(intvl)] = 1.0;
    }
    return inputs;
}

}  // namespace

void CChordHeavy::SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(TSingleChordAnalysisAlgo algo) {
    if (mNotes.empty()) {
        SetUndef();
        return;
    }
    const bool byNet = algo == TSingleChordAnalysisAlgo_NeuronalNet;
    SetRootNote(byNet ? _LikeliestRootByNet() : _LikeliestRootByScore());
    SetRootNoteEnhWithLeastSigns();
    AdjustEnhOfChordNotesToRootScale(nullptr);
}

CNote CChordHeavy::_LikeliestRootByNet() {
    const std::lock_guard lock(LockOfNetForSingleChordAnalysis());
    // The root for now: in its octave, so that the intervals count from the lowest note.
    mRootNote = LowestNote();
    mRootNoteSpecified = true;
    SetBassKeyEnh(mRootNote.KeyEnh());
    UpdateIntvlSetAndBassNoteHasIntvlAlone();

    NeuronalNet& net = NetForSingleChordAnalysis();
    net.use(NetInputsOf(*this, net.get_input_neuron_count()));
    return {FoldIntoOctave(mRootNote.KeyNr() + static_cast<int>(net.winner())), TEnh_n};
}

void CChordHeavy::SetWrapIntvlToNeuronalNetInputCount() {
    const std::lock_guard lock(LockOfNetForSingleChordAnalysis());
    IntvlSet_SetWrapIntvl(NetForSingleChordAnalysis().get_input_neuron_count());
}

}  // namespace brindle
