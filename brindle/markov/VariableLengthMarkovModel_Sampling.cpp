// SPDX-License-Identifier: MIT
#include "brindle/markov/TMarkovSamplingInformation.h"
#include "brindle/markov/VariableLengthMarkovModel.h"

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <ctime>
#include <map>

namespace brindle {
namespace {

// A sequence that missed its length is below.
constexpr double kLowestAccepted = -700.0;

/// Sequences, each once with its count.
class CDistinctSequences {
public:
    explicit CDistinctSequences(std::vector<TMarkovSampledSequence>& sequences)
        : mSequences(sequences) {
        for (std::size_t ix = 0; ix < sequences.size(); ++ix) {
            mIndices.emplace(PlacesOf(sequences[ix]), ix);
        }
    }

    void Add(const TMarkovSampledSequence& sequence) {
        const auto [entry, isNew] = mIndices.emplace(PlacesOf(sequence), mSequences.size());
        if (isNew) {
            mSequences.push_back(sequence);
        } else {
            ++mSequences[entry->second].mCount;
        }
    }

private:
    using TPlaces = std::vector<std::uint32_t>;

    // Symbols of a store are equal when they have one place.
    static TPlaces PlacesOf(const TMarkovSampledSequence& sequence) {
        TPlaces places;
        places.reserve(sequence.mSymbols.size());
        for (const MarkovIterator symbol : sequence.mSymbols) places.push_back(symbol->mPlace);
        return places;
    }

    std::vector<TMarkovSampledSequence>& mSequences;
    std::map<TPlaces, std::size_t> mIndices;
};

}  // namespace

void VariableLengthMarkovModel::SampleSequenceWithLength(
    TMarkovSampledSequence& out, std::vector<TMarkovSampledSequence>& sequences, bool recursive,
    const TMarkovGenerateOptions& options) {
    if (!options.IsValid(*this)) return;
    // Kept for hosts that draw from it; no draw of ours does.
    std::srand(static_cast<unsigned>(std::time(nullptr)));
    out = {};
    TMarkovSamplingInformation info;
    CDistinctSequences distinct(sequences);
    std::vector<CMarkovWeightedSequence> accepted;
    MarkovSequence start;
    Subvector(options.mMaxHistoryLength, {}, start);
    std::uint64_t attempts = 0;
    do {
        TMarkovSampledSequence sequence;
        if (recursive) {
            const auto begin = std::chrono::steady_clock::now();
            const bool isFound = RecursiveGenerateSequence(sequence, options, info);
            info.mTime =
                std::chrono::duration<double>(std::chrono::steady_clock::now() - begin).count();
            info.Clear(false);
            // The dead ends stay known: when the start is one, no other attempt will get further.
            if (!isFound && (info.mHasGivenUp || info.IsDeadEnd(0.0, start))) break;
        } else {
            GenerateSequenceWithFixedLength(options.mMaxHistoryLength, sequence, options);
        }
        if (!(sequence.mLogProbability > kLowestAccepted) || sequence.mSymbols.empty()) continue;
        accepted.push_back({sequence, sequence.mLogProbability});
        distinct.Add(sequence);
    } while (accepted.size() < options.mSampleCount && ++attempts < mSearchLimits.mAttempts);
    NormalizeLogProbabilities(accepted);
    ChooseFromWeightedSequences(accepted, out);
    // Stable, since weights that are not a number have no order.
    std::stable_sort(sequences.begin(), sequences.end(), CompareSequencesByWeightAndEntropy);
}

}  // namespace brindle
