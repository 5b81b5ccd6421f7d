// SPDX-License-Identifier: MIT
#include "brindle/markov/TMarkovSamplingInformation.h"

#include <algorithm>
#include <iterator>

namespace brindle {
namespace {

bool EndsIn(MarkovSequenceView history, MarkovSequenceView end) {
    if (history.size() < end.size()) return false;
    return std::equal(
        end.begin(), end.end(), history.last(end.size()).begin(),
        [](MarkovIterator a, MarkovIterator b) { return a->mOrderClass == b->mOrderClass; });
}

}  // namespace

bool TMarkovSamplingInformation::CFromNewest::operator()(MarkovSequenceView a,
                                                         MarkovSequenceView b) const {
    return std::lexicographical_compare(a.rbegin(), a.rend(), b.rbegin(), b.rend(), CMarkovLess());
}

void TMarkovSamplingInformation::Clear(bool blocklistToo) {
    mDepths.clear();
    mBeats.clear();
    mBranching.clear();
    if (!blocklistToo) return;
    mBlocklist.clear();
    mBlockedCount = 0;
}

// The stored history in which the given one ends. No stored history ends in another one, so that
// only the last of those that come before the given one can be it.
TMarkovSamplingInformation::THistories::const_iterator TMarkovSamplingInformation::EndOf(
    const THistories& histories, MarkovSequenceView history) {
    const auto behind = histories.upper_bound(history);
    if (behind == histories.begin()) return histories.end();
    const auto candidate = std::prev(behind);
    return EndsIn(history, *candidate) ? candidate : histories.end();
}

void TMarkovSamplingInformation::AddToBlocklist(double beats, MarkovSequenceView history) {
    THistories& histories = mBlocklist[beats];
    if (EndOf(histories, history) != histories.end()) return;
    auto longer = histories.lower_bound(history);
    while (longer != histories.end() && EndsIn(*longer, history)) longer = histories.erase(longer);
    histories.emplace_hint(longer, history.begin(), history.end());
}

bool TMarkovSamplingInformation::IsBlocklisted(double beats, MarkovSequenceView history) {
    const bool isBlocked = IsDeadEnd(beats, history);
    if (isBlocked) ++mBlockedCount;
    return isBlocked;
}

bool TMarkovSamplingInformation::IsDeadEnd(double beats, MarkovSequenceView history) const {
    const auto atBeats = mBlocklist.find(beats);
    return atBeats != mBlocklist.end() && EndOf(atBeats->second, history) != atBeats->second.end();
}

std::size_t TMarkovSamplingInformation::BlocklistSize() const {
    std::size_t size = 0;
    for (const auto& [beats, histories] : mBlocklist) size += histories.size();
    return size;
}

}  // namespace brindle
