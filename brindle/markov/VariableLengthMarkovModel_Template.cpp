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

/// How many symbols in a row are fixed, back from the last one. All that could stand before the
/// start count as fixed.
class CFixedRun {
public:
    void Append(bool isFixed) {
        if (!isFixed) {
            mLength = 0;
        } else if (mLength < kEndless) {
            ++mLength;
        }
    }
    [[nodiscard]] std::uint64_t Length() const { return mLength; }

private:
    static constexpr std::uint64_t kEndless = std::numeric_limits<std::uint64_t>::max();

    std::uint64_t mLength = kEndless;
};

/// Whether a symbol may be drawn from what fits behind a history. `entropyRatio` is its entropy by
/// the largest one that it could have.
bool IsAccepted(const MarkovProbabilities& fitting, double entropyRatio, double remaining,
                bool isShortest, const TMarkovGenerateOptions& options) {
    if (fitting.empty()) return false;
    // An entropy that is not a number passes.
    if (!(entropyRatio < options.mMinNormalizedEntropy)) return true;
    if (isShortest) return options.mAcceptAtMinHistory;
    return options.mAcceptExactFill &&
           static_cast<double>(VariableLengthMarkovModel::GetMaxLengthFromProbabilities(fitting)) ==
               remaining;
}

}  // namespace

bool VariableLengthMarkovModel::AppendNextFittingSymbol(
    TMarkovSampledSequence& sequence, double remaining, const MarkovSymbolSet& excluded,
    const TMarkovGenerateOptions& options, TMarkovSamplingInformation& info, std::uint64_t length) {
    if (length == kMarkovLongestHistory) length = options.mMaxHistoryLength;
    // No longer history was ever seen.
    length = std::min(length, mMaxHistoryLength);
    MarkovSequence longest;
    Subvector(length, sequence.mSymbols, longest);
    MarkovProbabilities table;
    for (MarkovSequenceView history(longest);; history = history.subspan(1)) {
        ProbabilitiesForNextSymbol(history, table);
        const std::size_t candidates = table.size();
        const double entropy = CalculateEntropy(table);
        const double maxEntropy = std::log(static_cast<double>(candidates));
        RemoveItemsFromProbabilities(table, excluded);
        RemoveNonFittingSymbolsFromProbabilities(table, remaining);
        const bool isShortest = history.size() <= options.mMinHistoryLength || history.empty();
        const double ratio = entropy / (maxEntropy + kNotZero);
        if (IsAccepted(table, ratio, remaining, isShortest, options)) {
            const MarkovIterator chosen = ChooseFromProbabilities(table);
            sequence.Append(
                {table.at(chosen), entropy / maxEntropy, maxEntropy, history.size(), chosen});
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
    const CMarkovTemplate::CNext next = wanted.NextAt(beats);
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
    MarkovSequence window;
    MarkovProbabilities table;
    CFixedRun run;
    const auto weigh = [&](MarkovSequenceView before, MarkovIterator fixed) {
        if (run.Length() >= options.mEvidenceHistoryLength) return;
        // No history longer than N was ever seen, so one more symbol finds as little.
        Subvector(std::min(options.mEvidenceHistoryLength, mMaxHistoryLength + 1), before, window);
        ProbabilitiesForNextSymbol(window, table);
        const auto found = table.find(fixed);
        sequence.mLogProbability += found == table.end() ? -std::numeric_limits<double>::infinity()
                                                         : std::log(found->second);
    };
    const MarkovSequenceView symbols(sequence.mSymbols);
    double beats = 0.0;
    for (std::size_t place = 0; place < symbols.size(); ++place) {
        const MarkovIterator symbol = symbols[place];
        const bool isFixed = wanted.HasChordAt(beats);
        if (isFixed) weigh(symbols.first(place), symbol);
        run.Append(isFixed);
        if (symbol->HasBeats()) beats += symbol->mChord.mLength;
    }
    weigh(symbols, endSymbol);
}

}  // namespace brindle
