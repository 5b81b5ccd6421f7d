// SPDX-License-Identifier: MIT
#include "brindle/markov/CMarkovTransitionMap.h"

#include <algorithm>
#include <limits>

namespace brindle {
namespace {

constexpr std::uint32_t kNoEntry = std::numeric_limits<std::uint32_t>::max();
// Stands for the entry of the empty history, which holds no counts.
constexpr std::uint32_t kEmptyHistory = kNoEntry - 1;
constexpr std::size_t kFirstSlots = 64;
constexpr std::size_t kKeptPieceSize = std::size_t{1} << 16;

/// The place of each symbol's class in the order of symbols.
class CRanks {
public:
    template <class Entries>
    explicit CRanks(const Entries& entries) {
        std::vector<MarkovIterator> symbols;
        for (const TMarkovTransitions* const entry : entries) {
            for (const MarkovIterator symbol : entry->mHistory) {
                if (IsNew(symbol->mOrderClass)) symbols.push_back(symbol);
            }
        }
        std::sort(symbols.begin(), symbols.end(), TMarkovLess());
        for (std::uint32_t rank = 0; rank < symbols.size(); ++rank) {
            mRanks[symbols[rank]->mOrderClass] = rank;
        }
    }

    bool operator()(const TMarkovTransitions* a, const TMarkovTransitions* b) const {
        return std::lexicographical_compare(
            a->mHistory.begin(), a->mHistory.end(), b->mHistory.begin(), b->mHistory.end(),
            [this](MarkovIterator x, MarkovIterator y) {
                return mRanks[x->mOrderClass] < mRanks[y->mOrderClass];
            });
    }

private:
    bool IsNew(std::uint32_t orderClass) {
        if (orderClass >= mRanks.size()) mRanks.resize(orderClass + 1, kNoEntry);
        if (mRanks[orderClass] != kNoEntry) return false;
        mRanks[orderClass] = 0;
        return true;
    }

    std::vector<std::uint32_t> mRanks;
};

std::vector<const TMarkovTransitions*> Sorted(std::vector<const TMarkovTransitions*> entries) {
    const CRanks ranks(entries);
    std::sort(entries.begin(), entries.end(), std::cref(ranks));
    return entries;
}

}  // namespace

void CMarkovTransitionMap::AddToAllLengths(MarkovSequenceView history, MarkovIterator symbol,
                                           std::uint32_t count) {
    MarkovSequenceView kept;
    std::uint32_t entry = kEmptyHistory;
    for (std::size_t length = 1; length <= history.size(); ++length) {
        const std::uint32_t shorter = entry;
        entry = FindEntry(shorter, history[history.size() - length]->mOrderClass);
        if (entry == kNoEntry) {
            // All longer histories are new, too, and share these symbols.
            if (kept.empty()) kept = Keep(history);
            entry = AddEntry(shorter, kept.last(length));
        }
        mEntries[entry].mCounts[symbol] += count;
    }
}

const MarkovCounts* CMarkovTransitionMap::Find(MarkovSequenceView history) const {
    std::uint32_t entry = kEmptyHistory;
    for (auto oldest = history.rbegin(); oldest != history.rend(); ++oldest) {
        entry = FindEntry(entry, (*oldest)->mOrderClass);
        if (entry == kNoEntry) return nullptr;
    }
    return entry == kEmptyHistory ? nullptr : &mEntries[entry].mCounts;
}

std::vector<const TMarkovTransitions*> CMarkovTransitionMap::InOrder() const {
    std::vector<const TMarkovTransitions*> entries;
    entries.reserve(size());
    for (const TEntry& entry : mEntries) entries.push_back(&entry);
    return Sorted(std::move(entries));
}

std::vector<const TMarkovTransitions*> CMarkovTransitionMap::InOrder(std::size_t length) const {
    return Sorted(OfLength(length));
}

std::vector<const TMarkovTransitions*> CMarkovTransitionMap::OfLength(std::size_t length) const {
    std::vector<const TMarkovTransitions*> entries;
    for (const TEntry& entry : mEntries) {
        if (entry.mHistory.size() == length) entries.push_back(&entry);
    }
    return entries;
}

void CMarkovTransitionMap::Clear() {
    *this = CMarkovTransitionMap();
}

std::uint32_t CMarkovTransitionMap::FindEntry(std::uint32_t shorter,
                                              std::uint32_t oldestClass) const {
    return mSlots.empty() ? kNoEntry : mSlots[SlotOf(shorter, oldestClass)];
}

// The slot that holds the entry, or the free one where it would be put.
std::size_t CMarkovTransitionMap::SlotOf(std::uint32_t shorter, std::uint32_t oldestClass) const {
    std::uint64_t hash = std::uint64_t{shorter} << 32U | oldestClass;
    hash = (hash ^ hash >> 31U) * 0x9E3779B97F4A7C15U;
    hash ^= hash >> 32U;
    const std::size_t mask = mSlots.size() - 1;
    std::size_t slot = static_cast<std::size_t>(hash) & mask;
    while (mSlots[slot] != kNoEntry) {
        const TEntry& entry = mEntries[mSlots[slot]];
        if (entry.mShorter == shorter && entry.mOldestClass == oldestClass) return slot;
        slot = (slot + 1) & mask;
    }
    return slot;
}

std::uint32_t CMarkovTransitionMap::AddEntry(std::uint32_t shorter, MarkovSequenceView history) {
    if (2 * (size() + 1) > mSlots.size()) GrowSlots();
    const auto number = static_cast<std::uint32_t>(size());
    const std::uint32_t oldestClass = history.front()->mOrderClass;
    TEntry& entry = mEntries.emplace_back();
    entry.mHistory = history;
    entry.mShorter = shorter;
    entry.mOldestClass = oldestClass;
    mSlots[SlotOf(shorter, oldestClass)] = number;
    return number;
}

void CMarkovTransitionMap::GrowSlots() {
    mSlots.assign(std::max(kFirstSlots, 2 * mSlots.size()), kNoEntry);
    for (std::uint32_t number = 0; number < size(); ++number) {
        const TEntry& entry = mEntries[number];
        mSlots[SlotOf(entry.mShorter, entry.mOldestClass)] = number;
    }
}

MarkovSequenceView CMarkovTransitionMap::Keep(MarkovSequenceView history) {
    const auto room = [this] {
        return mKeptSymbols.back().capacity() - mKeptSymbols.back().size();
    };
    if (mKeptSymbols.empty() || room() < history.size()) {
        mKeptSymbols.emplace_back().reserve(std::max(kKeptPieceSize, history.size()));
    }
    std::vector<MarkovIterator>& piece = mKeptSymbols.back();
    piece.insert(piece.end(), history.begin(), history.end());
    return MarkovSequenceView(piece).last(history.size());
}

}  // namespace brindle
