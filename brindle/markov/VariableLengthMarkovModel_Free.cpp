// SPDX-License-Identifier: MIT
#include "brindle/markov/VariableLengthMarkovModel.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace brindle {
namespace {

// Brings a weight below the limit of acceptance.
constexpr double kPenaltyForMissedLength = -750.0;
constexpr double kNever = -std::numeric_limits<double>::infinity();

}  // namespace

void VariableLengthMarkovModel::AppendNextSymbol(TMarkovSampledSequence& sequence,
                                                 MarkovSequenceView history,
                                                 const TMarkovGenerateOptions& options) {
    const MarkovIterator endSymbol = mObjects.getIteratorToObject(CMarkovObject_End);
    MarkovProbabilities table;
    for (; !history.empty(); history = history.subspan(1)) {
        ProbabilitiesForNextSymbol(history, table);
        if (table.empty()) continue;
        const auto end = endSymbol == mObjects.end() ? table.end() : table.find(endSymbol);
        if (end != table.end()) {
            if (table.size() == 1 && history.size() == 1) {
                sequence.Append({0.0, 0.0, 0.0, 1, endSymbol});
                return;
            }
            end->second = 0.0;
        }
        // Not a number where the sequence could have ended: such a table fails the test.
        const double entropy = CalculateEntropy(table);
        const double maxEntropy = std::log(static_cast<double>(table.size()));
        const bool isVaried =
            entropy >= options.mMinNormalizedEntropy * maxEntropy && maxEntropy > 0.0;
        if (history.size() > 1 && !isVaried) continue;
        const MarkovIterator chosen = ChooseFromProbabilities(table);
        sequence.Append(
            {table.at(chosen), entropy / maxEntropy, maxEntropy, history.size(), chosen});
        return;
    }
}

void VariableLengthMarkovModel::GenerateSequenceWithFixedLength(
    std::uint64_t length, TMarkovSampledSequence& sequence, const TMarkovGenerateOptions& options) {
    ValidateHistoryLength(length);
    QueryStartSequence();
    const double wanted = TMarkovSequenceLengthInBeats(options.mTemplate);
    double reached = 0.0;
    MarkovSequence history;
    while (wanted > reached && sequence.mSymbols.size() < kMarkovMaxFreeSymbols) {
        Subvector(length, sequence.mSymbols, history);
        const std::size_t sizeBefore = sequence.mSymbols.size();
        AppendNextSymbol(sequence, history, options);
        if (sequence.mSymbols.size() == sizeBefore) break;
        const CMarkovObject& symbol = *sequence.mSymbols.back();
        QueryAddSymbol(symbol);
        // Kept: whole beats only, so that symbols below one beat never get on.
        reached = std::trunc(reached + symbol.mChord.mLength);
    }
    if (reached != wanted && !sequence.mSymbols.empty()) {
        sequence.mLogProbability += kPenaltyForMissedLength;
    }
    if (sequence.AllElementsAreEqual()) {
        sequence.mLogProbability += std::log(options.mAllEqualFactor);
    }
    AddWeightOfEnding(length, sequence, options);
}

void VariableLengthMarkovModel::GenerateSequenceWithFixedLength(
    TMarkovSampledSequence& sequence, const TMarkovGenerateOptions& options) {
    GenerateSequenceWithFixedLength(mMaxHistoryLength, sequence, options);
}

// The chance that the sequence ends here, behind the longest history that ever ended one.
void VariableLengthMarkovModel::AddWeightOfEnding(std::uint64_t length,
                                                  TMarkovSampledSequence& sequence,
                                                  const TMarkovGenerateOptions& options) {
    const MarkovIterator endSymbol = mObjects.getIteratorToObject(CMarkovObject_End);
    const std::uint64_t shortest = std::max<std::uint64_t>(options.mMinHistoryLength, 1);
    MarkovSequence window;
    HistorySubvector(length, window);
    const MarkovSequenceView history(window);
    MarkovProbabilities table;
    for (;; --length) {
        ProbabilitiesForNextSymbol(history.last(std::min<std::size_t>(length, history.size())),
                                   table);
        const auto end = endSymbol == mObjects.end() ? table.end() : table.find(endSymbol);
        if (end == table.end() && length > shortest) continue;
        sequence.mLogProbability += end == table.end() ? kNever : std::log(end->second);
        return;
    }
}

}  // namespace brindle
