// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovObjects.h"

#include <cstdint>
#include <deque>
#include <vector>

namespace brindle {

/// A history and how often each symbol followed it.
struct TMarkovTransitions {
    /// Oldest symbol first. Lives as long as the map.
    MarkovSequenceView mHistory;
    MarkovCounts mCounts;
};

/// The counts of a model: a map from histories of all lengths to the counts of what followed.
/// Histories whose symbols order alike are one entry, which shows the symbols that came first.
///
/// With a history all its ends are in the map, so an entry is found through that of the history
/// without its oldest symbol, by hash. Counting at all lengths takes one step for each length,
/// and no order is kept up meanwhile: InOrder makes it when it is wanted.
class CMarkovTransitionMap {
public:
    /// Adds `count` to the symbol behind the history and behind each of its ends, down to length 1.
    void AddToAllLengths(MarkovSequenceView history, MarkovIterator symbol, std::uint32_t count);

    /// The counts behind exactly this history; null if it was never seen.
    [[nodiscard]] const MarkovCounts* Find(MarkovSequenceView history) const;

    /// The number of histories.
    [[nodiscard]] std::size_t size() const { return mEntries.size(); }
    [[nodiscard]] bool empty() const { return mEntries.empty(); }

    /// All entries, their histories in lexicographic order, a shorter one before its continuations;
    /// or those of one length.
    [[nodiscard]] std::vector<const TMarkovTransitions*> InOrder() const;
    [[nodiscard]] std::vector<const TMarkovTransitions*> InOrder(std::size_t length) const;
    /// The same without order.
    [[nodiscard]] std::vector<const TMarkovTransitions*> OfLength(std::size_t length) const;

    void Clear();

private:
    struct TEntry : TMarkovTransitions {
        /// The entry of the history without its oldest symbol, and the class of that symbol.
        std::uint32_t mShorter = 0;
        std::uint32_t mOldestClass = 0;
    };

    [[nodiscard]] std::uint32_t FindEntry(std::uint32_t shorter, std::uint32_t oldestClass) const;
    [[nodiscard]] std::size_t SlotOf(std::uint32_t shorter, std::uint32_t oldestClass) const;
    std::uint32_t AddEntry(std::uint32_t shorter, MarkovSequenceView history);
    void GrowSlots();
    [[nodiscard]] MarkovSequenceView Keep(MarkovSequenceView history);

    std::deque<TEntry> mEntries;
    /// Open addressing: the number of an entry, or kNoEntry.
    std::vector<std::uint32_t> mSlots;
    /// The symbols of the histories, in pieces that never move.
    std::vector<std::vector<MarkovIterator>> mKeptSymbols;
};

}  // namespace brindle
