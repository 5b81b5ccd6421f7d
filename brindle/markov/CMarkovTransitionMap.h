// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovCounts.h"

#include <array>
#include <cstdint>
#include <vector>

namespace brindle {

/// A history and how often each symbol followed it.
struct CMarkovTransitions {
    /// Oldest symbol first. Lives as long as the map.
    MarkovSequenceView mHistory;
    MarkovCounts mCounts;  ///< what followed; empty for a history that nothing has followed yet
};

/// The counts of a model: a map from histories of all lengths to the counts of what followed.
/// Histories whose symbols order alike are one entry, which shows the symbols that came first.
///
/// Entries are found by hash. With a history all its ends are in the map, so that counting at all
/// lengths compares no histories: an entry is known by that of the history without its oldest
/// symbol. No order is kept up meanwhile; InOrder makes it when it is wanted.
class CMarkovTransitionMap {
public:
    CMarkovTransitionMap() = default;
    // Entries look into the symbols that are kept here, so a copy would look into another map.
    CMarkovTransitionMap(const CMarkovTransitionMap&) = delete;
    CMarkovTransitionMap& operator=(const CMarkovTransitionMap&) = delete;
    /// Leaves the other map empty.
    CMarkovTransitionMap(CMarkovTransitionMap&& other) noexcept { Swap(other); }
    /// The same; what this map held is gone.
    CMarkovTransitionMap& operator=(CMarkovTransitionMap&& other) noexcept;
    ~CMarkovTransitionMap() = default;

    /// The history and each of its ends, down to length 1, with an empty table if they are new.
    void AddHistory(MarkovSequenceView history);
    /// Adds `count` to the symbol behind the history and behind each of its ends, down to length 1.
    void AddToAllLengths(MarkovSequenceView history, MarkovIterator symbol, std::uint32_t count);

    /// The counts behind exactly this history; null if it was never seen.
    [[nodiscard]] const MarkovCounts* Find(MarkovSequenceView history) const;

    /// The number of histories.
    [[nodiscard]] std::size_t size() const { return mSize; }
    /// Whether no history was seen.
    [[nodiscard]] bool empty() const { return mSize == 0; }

    /// All entries, their histories in lexicographic order, a shorter one before its continuations;
    /// or those of one length.
    [[nodiscard]] std::vector<const CMarkovTransitions*> InOrder() const;
    /// The entries with a history of this many symbols, in that order.
    [[nodiscard]] std::vector<const CMarkovTransitions*> InOrder(std::size_t length) const;
    /// The same without order.
    [[nodiscard]] std::vector<const CMarkovTransitions*> OfLength(std::size_t length) const;

    /// Whether the counts are such as learning gives, which those of a file need not be: none is 0,
    /// and those of no history add up to more than 2^31 - 1, as a sum that is negative would
    /// follow.
    [[nodiscard]] bool HasUsualCounts() const;

    /// Forgets all histories; what Find and InOrder gave is dead then.
    void Clear();

private:
    /// As large as a line of the usual processor's cache.
    struct alignas(64) CEntry : CMarkovTransitions {
        /// The entry of the history without its oldest symbol, and the class of that symbol.
        std::uint32_t mShorter = 0;
        std::uint32_t mOldestClass = 0;
    };
    /// A free place in the table has the entry kNoEntry.
    struct CSlot {
        std::uint32_t mHash = 0;
        std::uint32_t mEntry = 0;
    };

    void Swap(CMarkovTransitionMap& other) noexcept;
    [[nodiscard]] const CEntry& At(std::uint32_t number) const;
    [[nodiscard]] CEntry& At(std::uint32_t number);
    template <class IsWanted>
    [[nodiscard]] const CSlot& SlotOf(std::uint32_t hash, IsWanted isWanted) const;
    /// Calls `change` with the counts of the history and of each of its ends, the shortest first.
    template <class Change>
    void ForAllLengths(MarkovSequenceView history, Change change);
    std::uint32_t AddEntry(std::uint32_t shorter, MarkovSequenceView history);
    void Fetch(MarkovSequenceView history) const;
    void GrowSlots();
    [[nodiscard]] MarkovSequenceView Keep(MarkovSequenceView history);

    /// In pieces that never move.
    std::vector<std::vector<CEntry>> mEntries;
    std::size_t mSize = 0;
    /// Open addressing by the hash of the history.
    std::vector<CSlot> mSlots;
    /// The symbols of the histories, in pieces that never move.
    std::vector<std::vector<MarkovIterator>> mKeptSymbols;
};

}  // namespace brindle
