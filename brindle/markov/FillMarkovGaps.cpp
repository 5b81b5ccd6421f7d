// SPDX-License-Identifier: MIT
#include "brindle/markov/FillMarkovGaps.h"

#include <cstddef>

namespace brindle {
namespace {

// A gap and the end of a sequence are symbols, too, and can be drawn for a gap.
constexpr int kMostDraws = 100;

/// Draws a chord for the first gap.
std::optional<MarkovIterator> DrawChord(VariableLengthMarkovModel& model,
                                        const MarkovSequence& sequence, double length) {
    std::optional<MarkovIterator> otherLength;
    for (int draw = 0; draw < kMostDraws; ++draw) {
        model.QueryStartSequence();
        const MarkovIterator drawn = model.FillGapInSequence(sequence);
        if (drawn->mType != TMarkovObjectType_Chord) continue;
        if (drawn->mChord.mLength == length) return drawn;
        if (!otherLength) otherLength = drawn;
    }
    return otherLength;
}

/// False, and the sequence as it was, if a gap could not be filled by histories of the model's
/// length.
bool FillByLength(VariableLengthMarkovModel& model, MarkovSequence& sequence) {
    // Start symbols before the sequence, so that a gap near its front has its real neighbours.
    MarkovSequence padded;
    model.Subvector(model.mMaxHistoryLength + sequence.size(), sequence, padded);
    for (MarkovIterator& symbol : padded) {
        if (!symbol->IsGap()) continue;
        const auto chord = DrawChord(model, padded, symbol->mChord.mLength);
        if (!chord) return false;
        symbol = *chord;
    }
    const auto offset = static_cast<std::ptrdiff_t>(model.mMaxHistoryLength);
    sequence.assign(padded.begin() + offset, padded.end());
    return true;
}

}  // namespace

std::optional<MarkovSequence> FillMarkovGaps(VariableLengthMarkovModel& model,
                                             const MarkovSequence& sequence) {
    MarkovSequence filled = sequence;
    // A model holds the counts of all lower orders, too.
    for (; model.mMaxHistoryLength > 0; --model.mMaxHistoryLength) {
        if (FillByLength(model, filled)) return filled;
    }
    return std::nullopt;
}

}  // namespace brindle
