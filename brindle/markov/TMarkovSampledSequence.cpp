// SPDX-License-Identifier: MIT
#include "brindle/markov/TMarkovSampledSequence.h"

#include <algorithm>
#include <cmath>
#include <numeric>
#include <ostream>

namespace brindle {
namespace {

bool AreEqual(const CMarkovObject& a, const CMarkovObject& b) {
    return a == b;
}

double Weight(const TMarkovSampledSequence& sequence) {
    return std::exp(sequence.mLogProbability) * sequence.mCount;
}

}  // namespace

bool operator<(const TMarkovSampledObject& a, const TMarkovSampledObject& b) {
    if (*a.mObject < *b.mObject) return true;
    return AreEqual(*a.mObject, *b.mObject) && a.mProbability < b.mProbability;
}

bool TMarkovSampledSequence::AllElementsAreEqual() const {
    return std::all_of(mSymbols.begin(), mSymbols.end(), [this](MarkovIterator symbol) {
        return AreEqual(*symbol, *mSymbols.front());
    });
}

double TMarkovSampledSequence::SumOfEntropies() const {
    return std::accumulate(mEntropies.begin(), mEntropies.end(), 0.0);
}

void TMarkovSampledSequence::Append(const TMarkovSampledObject& object) {
    mEntropies.push_back(object.mNormalizedEntropy);
    mSampledObjects.push_back(object);
    mSymbols.push_back(object.mObject);
}

void TMarkovSampledSequence::RemoveLast() {
    if (mSymbols.empty()) return;
    mEntropies.pop_back();
    mSampledObjects.pop_back();
    mSymbols.pop_back();
}

bool operator<(const TMarkovSampledSequence& a, const TMarkovSampledSequence& b) {
    if (a.mCount != b.mCount) return a.mCount < b.mCount;
    const auto& ofA = a.mSampledObjects;
    const auto& ofB = b.mSampledObjects;
    if (ofA.size() != ofB.size()) return ofA.size() < ofB.size();
    for (std::size_t ix = 0; ix < ofA.size(); ++ix) {
        if (ofA[ix] < ofB[ix]) return true;
        if (ofB[ix] < ofA[ix]) return false;
    }
    if (a.mLogProbability != b.mLogProbability) return a.mLogProbability < b.mLogProbability;
    return a.SumOfEntropies() < b.SumOfEntropies();
}

bool CompareSequencesByWeightAndEntropy(const TMarkovSampledSequence& a,
                                        const TMarkovSampledSequence& b) {
    const double ofA = Weight(a);
    const double ofB = Weight(b);
    return ofA != ofB ? ofA < ofB : a < b;
}

std::ostream& operator<<(std::ostream& stream, const TMarkovSampledObject& object) {
    return stream << "TMarkovSampledObject: probability " << object.mProbability << ", entropy "
                  << object.mNormalizedEntropy << " of " << object.mMaxEntropy
                  << ", history length " << object.mHistoryLength << ", "
                  << static_cast<const CMarkovObject&>(*object.mObject);
}

std::ostream& operator<<(std::ostream& stream, const TMarkovSampledSequence& sequence) {
    stream << "TMarkovSampledSequence: count " << sequence.mCount << ", log probability "
           << sequence.mLogProbability << '\n';
    for (const TMarkovSampledObject& object : sequence.mSampledObjects) stream << object << '\n';
    return stream;
}

}  // namespace brindle
