// SPDX-License-Identifier: MIT
#include "brindle/markov/TMarkovSamplingInformation.h"
#include "brindle/markov/VariableLengthMarkovModel.h"
#include "brindle/markov/internal/CMarkovTemplate.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace brindle {
namespace {

// Keeps a table of one entry, whose maximal entropy is 0, from being divided by 0.
constexpr double kNotZero = 1e-5;

}  // namespace

bool VariableLengthMarkovModel::AppendNextFittingSymbol(
    TMarkovSampledSequence& sequence, double remaining, const MarkovSymbolSet& excluded,
    const TMarkovGenerateOptions& options, TMarkovSamplingInformation& info, std::uint64_t length) {
    if (length == kMarkovLongestHistory) length = options.mMaxHistoryLength;
    // No longer history was ever seen.
    length = std::min(length, mMaxHistoryLength);
    MarkovSequence history;
    Subvector(length, sequence.mSymbols, history);
    MarkovProbabilities table;
    for (;; --length) {
        ProbabilitiesForNextSymbol(MarkovSequenceView(history).last(length), table);
        const std::size_t candidates = table.size();
        const double entropy = CalculateEntropy(table);
        const double maxEntropy = std::log(static_cast<double>(candidates));
        RemoveItemsFromProbabilities(table, excluded);
        RemoveNonFittingSymbolsFromProbabilities(table, remaining);
        // An entropy that is not a number passes.
        const bool isVaried = !(entropy / (maxEntropy + kNotZero) < options.mMinNormalizedEntropy);
        const bool isShortest = length <= options.mMinHistoryLength || length == 0;
        const auto fillsExactly = [&] {
            return options.mAcceptExactFill &&
                   static_cast<double>(GetMaxLengthFromProbabilities(table)) == remaining;
        };
        const bool isAccepted =
            !table.empty() &&
            (isVaried || (isShortest ? options.mAcceptAtMinHistory : fillsExactly()));
        if (isAccepted) {
            const MarkovIterator chosen = ChooseFromProbabilities(table);
            sequence.Append({table.at(chosen), entropy / maxEntropy, maxEntropy, length, chosen});
            info.mBranching.push_back(static_cast<std::int32_t>(candidates));
            return true;
        }
        if (isShortest) return false;
    }
}

void VariableLengthMarkovModel::NextGivenObjectAndDistance(MarkovIterator& object, double& distance,
                                                           const TMarkovGenerateOptions& options,
                                                           double beats) {
    const CMarkovTemplate wanted(options.mTemplate,
                                 mObjects.insertObjectIfUnique(CMarkovObject_End));
    const CMarkovTemplate::TNext next = wanted.NextAt(beats);
    object = next.mObject;
    distance = next.mDistance;
}

// Likelihood weighting: each fixed symbol weighs with its chance behind the window before it. Where
// the whole window is fixed, too, the chance is the same in all samples and says nothing.
void VariableLengthMarkovModel::CalculateEvidenceProbability(
    TMarkovSampledSequence& sequence, const TMarkovGenerateOptions& options) {
    if (sequence.AllElementsAreEqual()) {
        sequence.mLogProbability += std::log(options.mAllEqualFactor);
    }
    const MarkovIterator endSymbol = mObjects.insertObjectIfUnique(CMarkovObject_End);
    const CMarkovTemplate wanted(options.mTemplate, endSymbol);
    const MarkovSequenceView symbols(sequence.mSymbols);
    MarkovSequence window;
    MarkovProbabilities table;
    double beats = 0.0;
    // How many places, counted back from the current one, are fixed; those before the start are.
    std::uint64_t fixedBefore = std::numeric_limits<std::uint64_t>::max();
    for (std::size_t place = 0; place <= symbols.size(); ++place) {
        const bool isEnd = place == symbols.size();
        const bool isFixed = isEnd || wanted.HasChordAt(beats);
        if (isFixed && fixedBefore < options.mEvidenceHistoryLength) {
            // No history longer than N was ever seen, so one more symbol finds as little.
            Subvector(std::min(options.mEvidenceHistoryLength, mMaxHistoryLength + 1),
                      symbols.first(place), window);
            ProbabilitiesForNextSymbol(window, table);
            const auto found = table.find(isEnd ? endSymbol : symbols[place]);
            sequence.mLogProbability += found == table.end()
                                            ? -std::numeric_limits<double>::infinity()
                                            : std::log(found->second);
        }
        if (isEnd) return;
        if (!isFixed) {
            fixedBefore = 0;
        } else if (fixedBefore < std::numeric_limits<std::uint64_t>::max()) {
            ++fixedBefore;
        }
        if (symbols[place]->HasBeats()) beats += symbols[place]->mChord.mLength;
    }
}

}  // namespace brindle
