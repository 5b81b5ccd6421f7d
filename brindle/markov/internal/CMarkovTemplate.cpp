// SPDX-License-Identifier: MIT
#include "brindle/markov/internal/CMarkovTemplate.h"

#include "brindle/markov/VariableLengthMarkovModel.h"

#include <algorithm>
#include <cmath>

namespace brindle {

CMarkovTemplate::CMarkovTemplate(MarkovSequenceView symbols, MarkovIterator endSymbol)
    : mEndSymbol(endSymbol), mLength(std::trunc(TMarkovSequenceLengthInBeats(symbols))) {
    double position = 0.0;
    for (const MarkovIterator symbol : symbols) {
        if (!symbol->IsGap()) {
            const double before = mFixed.empty() ? position : mFixed.back().mReached;
            mFixed.push_back({symbol, position, std::max(before, position)});
        }
        const bool isChord = symbol->mType == TMarkovObjectType_Chord;
        if (isChord && !std::isnan(position)) mChordPositions.push_back(position);
        // Kept: positions are whole beats, cut off anew behind each symbol.
        position = std::trunc(position + symbol->mChord.mLength);
    }
    std::sort(mChordPositions.begin(), mChordPositions.end());
}

CMarkovTemplate::CNext CMarkovTemplate::NextAt(double beats) const {
    const auto next =
        std::lower_bound(mFixed.begin(), mFixed.end(), beats,
                         [](const CFixed& fixed, double at) { return fixed.mReached < at; });
    if (next == mFixed.end()) return {mEndSymbol, mLength - beats};
    return {next->mObject, next->mPosition - beats};
}

bool CMarkovTemplate::HasChordAt(double beats) const {
    return std::binary_search(mChordPositions.begin(), mChordPositions.end(), beats);
}

}  // namespace brindle
