// SPDX-License-Identifier: MIT
#include "brindle/markov/MarkovContinuations.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

CMarkovHistories HistoriesOfLength(const VariableLengthMarkovModel& model, std::size_t length) {
    CMarkovHistories histories{length};
    double places = 0.0;
    MarkovProbabilities table;
    for (const CMarkovTransitions* const entry : model.mTransitionMap.OfLength(length)) {
        model.ProbabilitiesForNextSymbol(entry->mHistory, table);
        double count = 0.0;
        for (const auto& successor : entry->mCounts) count += successor.second;
        const double entropy = model.CalculateEntropy(table);
        ++histories.mCount;
        if (table.empty() || std::isnan(entropy)) continue;
        histories.mEntropy += entropy * count;
        histories.mMaxEntropy += std::log(static_cast<double>(table.size())) * count;
        places += count;
    }
    if (places > 0.0) {
        histories.mEntropy /= places;
        histories.mMaxEntropy /= places;
    }
    return histories;
}

}  // namespace

std::vector<CMarkovHistories> HistoriesByLength(const VariableLengthMarkovModel& model) {
    std::vector<CMarkovHistories> rows;
    for (std::size_t length = 1; length <= model.mMaxHistoryLength; ++length) {
        rows.push_back(HistoriesOfLength(model, length));
    }
    return rows;
}

std::vector<CMarkovContinuation> MarkovContinuations(const VariableLengthMarkovModel& model,
                                                     MarkovSequence& history) {
    const MarkovCounts* counts = nullptr;
    const auto isContinued = [&] {
        counts = model.mTransitionMap.Find(history);
        return counts != nullptr && !counts->empty();
    };
    while (!history.empty() && !isContinued()) history.erase(history.begin());
    if (history.empty()) return {};
    MarkovProbabilities table;
    model.ProbabilitiesForNextSymbol(history, table);
    std::vector<CMarkovContinuation> continuations;
    for (const auto& [symbol, count] : *counts) {
        const auto found = table.find(symbol);
        continuations.push_back({symbol, count, found == table.end() ? 0.0 : found->second});
    }
    std::stable_sort(continuations.begin(), continuations.end(),
                     [](const CMarkovContinuation& a, const CMarkovContinuation& b) {
                         return a.mCount > b.mCount;
                     });
    return continuations;
}

}  // namespace brindle
