// SPDX-License-Identifier: MIT
#include "brindle/markov/VariableLengthMarkovModel.h"

#include <algorithm>
#include <map>

namespace brindle {
namespace {

double ValueOf(const MarkovProbabilities& table, MarkovIterator symbol) {
    const auto found = table.find(symbol);
    return found == table.end() ? 0.0 : found->second;
}

bool IsCandidate(const CMarkovObject& object) {
    return object != CMarkovObject_Start && object != CMarkovObject_Gap;
}

}  // namespace

MarkovIterator VariableLengthMarkovModel::FillGapInSequence(const MarkovSequence& sequence) {
    StartSequence();
    MarkovSequence filled(sequence);
    const auto firstGap = std::find_if(filled.begin(), filled.end(),
                                       [](MarkovIterator symbol) { return symbol->IsGap(); });
    const std::size_t gap =
        firstGap == filled.end() ? 0 : static_cast<std::size_t>(firstGap - filled.begin());
    const std::size_t n = mMaxHistoryLength;
    const std::size_t begin = gap > n ? gap - n : 0;
    const auto feed = [&](std::size_t place) {
        if (place < filled.size()) QueryAddSymbol(*filled[place]);
    };
    std::map<MarkovIterator, double, TMarkovLess> sums;
    MarkovProbabilities table;
    for (auto candidate = mObjects.begin(); candidate != mObjects.end(); ++candidate) {
        if (!IsCandidate(*candidate)) continue;
        // Kept: a gap among the first N places is fed here itself, with the last candidate in it.
        for (std::size_t place = begin; place < begin + n; ++place) feed(place);
        if (gap < filled.size()) filled[gap] = candidate;
        ProbabilitiesForNextSymbol(table);
        double sum = ValueOf(table, candidate);
        for (std::size_t place = begin + n; place < gap + n; ++place) {
            feed(place);
            ProbabilitiesForNextSymbol(table);
            if (place + 1 < filled.size()) sum += ValueOf(table, filled[place + 1]);
        }
        sums[candidate] = sum;
    }
    return ChooseFromProbabilities(
        MarkovProbabilities(boost::container::ordered_unique_range, sums.begin(), sums.end()));
}

}  // namespace brindle
