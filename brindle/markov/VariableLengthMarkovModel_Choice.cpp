// SPDX-License-Identifier: MIT
#include "brindle/markov/VariableLengthMarkovModel.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

// 1 / (2^32 - 1), so that the largest random number gives 1.
constexpr double kFractionOfBit = 2.3283064370807974e-10;
// Below every logarithm of a weight that counts.
constexpr double kLowestLogProbability = -2147483647.0;

/// The first item at which the running sum of values is above `threshold`, else the last one.
template <class Items, class ValueOf>
auto FirstAbove(const Items& items, double threshold, ValueOf valueOf) {
    double sum = 0.0;
    const auto found = std::find_if(items.begin(), items.end(), [&](const auto& item) {
        sum += valueOf(item);
        return sum > threshold;
    });
    return found == items.end() && !items.empty() ? std::prev(found) : found;
}

}  // namespace

double VariableLengthMarkovModel::RandomFraction() const {
    mRandomSource();  // Kept: the first number is thrown away.
    return mRandomSource() * kFractionOfBit;
}

MarkovIterator VariableLengthMarkovModel::ChooseFromProbabilities(
    const MarkovProbabilities& map) const {
    const double threshold = RandomFraction() * SumProbabilities(map);
    const auto chosen = FirstAbove(map, threshold, [](const auto& entry) { return entry.second; });
    return chosen == map.end() ? mObjects.end() : chosen->first;
}

void VariableLengthMarkovModel::ChooseFromWeightedSequences(
    const std::vector<CMarkovWeightedSequence>& sequences, TMarkovSampledSequence& out) const {
    double sum = 0.0;
    for (const CMarkovWeightedSequence& sequence : sequences) sum += sequence.mWeight;
    const auto chosen =
        FirstAbove(sequences, RandomFraction() * sum,
                   [](const CMarkovWeightedSequence& sequence) { return sequence.mWeight; });
    if (chosen != sequences.end()) out = chosen->mSequence;
}

void VariableLengthMarkovModel::NormalizeLogProbabilities(
    std::vector<CMarkovWeightedSequence>& sequences) {
    double largest = kLowestLogProbability;
    for (const auto& sequence : sequences) largest = std::max(largest, sequence.mWeight);
    if (!(largest > kLowestLogProbability)) return;
    for (auto& sequence : sequences) sequence.mWeight = std::exp(sequence.mWeight - largest);
}

void VariableLengthMarkovModel::RemoveItemsFromProbabilities(MarkovProbabilities& map,
                                                             const MarkovSymbolSet& symbols) {
    const auto isListed = [&symbols](const auto& entry) { return symbols.contains(entry.first); };
    map.erase(std::remove_if(map.begin(), map.end(), isListed), map.end());
}

void VariableLengthMarkovModel::RemoveNonFittingSymbolsFromProbabilities(MarkovProbabilities& map,
                                                                         double remaining) {
    const auto isTooLong = [remaining](const auto& entry) {
        const CMarkovObject& object = *entry.first;
        return object.mType == TMarkovObjectType_End ||
               (object.mType == TMarkovObjectType_Chord && object.mChord.mLength > remaining);
    };
    map.erase(std::remove_if(map.begin(), map.end(), isTooLong), map.end());
}

std::int64_t VariableLengthMarkovModel::GetMaxLengthFromProbabilities(
    const MarkovProbabilities& map) {
    if (map.empty()) return 0;
    // Beyond this a double holds no whole beats, and an integer soon no double.
    constexpr double limit = 9007199254740992.0;
    double longest = -limit;
    for (const auto& [symbol, value] : map) longest = std::max(longest, symbol->mChord.mLength);
    return static_cast<std::int64_t>(std::min(longest, limit));
}

}  // namespace brindle
