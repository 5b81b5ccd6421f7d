// SPDX-License-Identifier: MIT
#include "brindle/markov/CMarkovTransitionMap.h"

#include <algorithm>
#include <bit>
#include <limits>
#include <utility>

namespace brindle {
namespace {

constexpr std::uint32_t kNoEntry = std::numeric_limits<std::uint32_t>::max();
// Stands for the entry of the empty history, which holds no counts.
constexpr std::uint32_t kEmptyHistory = kNoEntry - 1;
constexpr std::size_t kFirstSlots = 64;
constexpr std::size_t kKeptPieceSize = std::size_t{1} << 16;

constexpr std::size_t kEntriesInPiece = std::size_t{1} << 12;

/// The hash of a history, from that of its newer symbols and the class of its oldest one.
std::uint32_t Longer(std::uint32_t hash, std::uint32_t oldestClass) {
    const std::uint64_t mixed =
        (std::uint64_t{hash} << 32U ^ (oldestClass + 1)) * 0x9E3779B97F4A7C15U;
    return static_cast<std::uint32_t>(mixed >> 32U ^ mixed >> 15U);
}

bool AreAlike(MarkovSequenceView a, MarkovSequenceView b) {
    return std::equal(
        a.begin(), a.end(), b.begin(), b.end(),
        [](MarkovIterator x, MarkovIterator y) { return x->mOrderClass == y->mOrderClass; });
}

/// Sorts histories. The first symbols of each are packed into a number, so that most comparisons
/// need not look at the history itself.
class CHistorySorter {
public:
    using TEntries = std::vector<const CMarkovTransitions*>;

    explicit CHistorySorter(const TEntries& entries) {
        FindRanks(entries);
        mSorted.reserve(entries.size());
        for (const CMarkovTransitions* const entry : entries) {
            mSorted.emplace_back(Packed(entry->mHistory), entry);
        }
        std::sort(mSorted.begin(), mSorted.end(), [this](const auto& a, const auto& b) {
            return a.first != b.first ? a.first < b.first : ComesBefore(*a.second, *b.second);
        });
    }

    [[nodiscard]] TEntries Sorted() const {
        TEntries entries;
        entries.reserve(mSorted.size());
        for (const auto& [packed, entry] : mSorted) entries.push_back(entry);
        return entries;
    }

private:
    // The place of each symbol's class in the order of symbols, counted from 1.
    void FindRanks(const TEntries& entries) {
        MarkovSequence symbols;
        for (const CMarkovTransitions* const entry : entries) {
            for (const MarkovIterator symbol : entry->mHistory) {
                if (IsNew(symbol->mOrderClass)) symbols.push_back(symbol);
            }
        }
        std::sort(symbols.begin(), symbols.end(), CMarkovLess());
        std::uint32_t rank = 0;
        for (const MarkovIterator symbol : symbols) mRanks[symbol->mOrderClass] = ++rank;
        mBitsOfRank = std::max(std::bit_width(rank), 1U);
    }
    bool IsNew(std::uint32_t orderClass) {
        if (orderClass >= mRanks.size()) mRanks.resize(orderClass + 1);
        return std::exchange(mRanks[orderClass], 1) == 0;
    }
    // No symbol is 0, so that shorter histories come before their continuations.
    [[nodiscard]] std::uint64_t Packed(MarkovSequenceView history) const {
        std::uint64_t packed = 0;
        for (std::size_t ix = 0; (ix + 1) * mBitsOfRank <= 64; ++ix) {
            packed <<= mBitsOfRank;
            if (ix < history.size()) packed |= mRanks[history[ix]->mOrderClass];
        }
        return packed;
    }
    [[nodiscard]] bool ComesBefore(const CMarkovTransitions& a, const CMarkovTransitions& b) const {
        return std::lexicographical_compare(
            a.mHistory.begin(), a.mHistory.end(), b.mHistory.begin(), b.mHistory.end(),
            [this](MarkovIterator x, MarkovIterator y) {
                return mRanks[x->mOrderClass] < mRanks[y->mOrderClass];
            });
    }

    std::vector<std::uint32_t> mRanks;
    unsigned mBitsOfRank = 1;
    std::vector<std::pair<std::uint64_t, const CMarkovTransitions*>> mSorted;
};

}  // namespace

// The slot that holds the wanted entry, or the free one where it would be put.
template <class IsWanted>
const CMarkovTransitionMap::CSlot& CMarkovTransitionMap::SlotOf(std::uint32_t hash,
                                                                IsWanted isWanted) const {
    const std::size_t mask = mSlots.size() - 1;
    for (std::size_t place = hash & mask;; place = (place + 1) & mask) {
        const CSlot& slot = mSlots[place];
        if (slot.mEntry == kNoEntry) return slot;
        if (slot.mHash == hash && isWanted(At(slot.mEntry))) return slot;
    }
}

template <class Change>
void CMarkovTransitionMap::ForAllLengths(MarkovSequenceView history, Change change) {
    Fetch(history);
    MarkovSequenceView kept;
    std::uint32_t entry = kEmptyHistory;
    std::uint32_t hash = 0;
    for (std::size_t length = 1; length <= history.size(); ++length) {
        if (2 * (size() + 1) > mSlots.size()) GrowSlots();
        const std::uint32_t oldestClass = history[history.size() - length]->mOrderClass;
        const std::uint32_t shorter = entry;
        hash = Longer(hash, oldestClass);
        const CSlot& slot = SlotOf(hash, [shorter, oldestClass](const CEntry& found) {
            return found.mShorter == shorter && found.mOldestClass == oldestClass;
        });
        entry = slot.mEntry;
        if (entry == kNoEntry) {
            // All longer histories are new, too, and share these symbols.
            if (kept.empty()) kept = Keep(history);
            entry = AddEntry(shorter, kept.last(length));
            mSlots[static_cast<std::size_t>(&slot - mSlots.data())] = {hash, entry};
        }
        change(At(entry).mCounts);
    }
}

void CMarkovTransitionMap::AddHistory(MarkovSequenceView history) {
    ForAllLengths(history, [](MarkovCounts&) {});
}

void CMarkovTransitionMap::AddToAllLengths(MarkovSequenceView history, MarkovIterator symbol,
                                           std::uint32_t count) {
    ForAllLengths(history, [symbol, count](MarkovCounts& counts) { counts[symbol] += count; });
}

// By the history itself and not through those of its ends, which are far apart in memory.
const MarkovCounts* CMarkovTransitionMap::Find(MarkovSequenceView history) const {
    if (empty() || history.empty()) return nullptr;
    std::uint32_t hash = 0;
    for (auto oldest = history.rbegin(); oldest != history.rend(); ++oldest) {
        hash = Longer(hash, (*oldest)->mOrderClass);
    }
    const CSlot& slot =
        SlotOf(hash, [history](const CEntry& entry) { return AreAlike(entry.mHistory, history); });
    return slot.mEntry == kNoEntry ? nullptr : &At(slot.mEntry).mCounts;
}

std::vector<const CMarkovTransitions*> CMarkovTransitionMap::InOrder() const {
    std::vector<const CMarkovTransitions*> entries;
    entries.reserve(size());
    for (const auto& piece : mEntries) {
        for (const CEntry& entry : piece) entries.push_back(&entry);
    }
    return CHistorySorter(entries).Sorted();
}

std::vector<const CMarkovTransitions*> CMarkovTransitionMap::InOrder(std::size_t length) const {
    return CHistorySorter(OfLength(length)).Sorted();
}

std::vector<const CMarkovTransitions*> CMarkovTransitionMap::OfLength(std::size_t length) const {
    std::vector<const CMarkovTransitions*> entries;
    for (const auto& piece : mEntries) {
        for (const CEntry& entry : piece) {
            if (entry.mHistory.size() == length) entries.push_back(&entry);
        }
    }
    return entries;
}

bool CMarkovTransitionMap::HasUsualCounts() const {
    constexpr std::uint64_t most = std::numeric_limits<std::int32_t>::max();
    const auto areUsual = [](const CEntry& entry) {
        std::uint64_t sum = 0;
        for (const auto& [symbol, count] : entry.mCounts) {
            if (count == 0) return false;
            sum += count;
        }
        return sum <= most;
    };
    return std::all_of(mEntries.begin(), mEntries.end(), [&](const std::vector<CEntry>& piece) {
        return std::all_of(piece.begin(), piece.end(), areUsual);
    });
}

CMarkovTransitionMap& CMarkovTransitionMap::operator=(CMarkovTransitionMap&& other) noexcept {
    CMarkovTransitionMap moved(std::move(other));
    Swap(moved);
    return *this;
}

void CMarkovTransitionMap::Swap(CMarkovTransitionMap& other) noexcept {
    mEntries.swap(other.mEntries);
    std::swap(mSize, other.mSize);
    mSlots.swap(other.mSlots);
    mKeptSymbols.swap(other.mKeptSymbols);
}

void CMarkovTransitionMap::Clear() {
    *this = CMarkovTransitionMap();
}

const CMarkovTransitionMap::CEntry& CMarkovTransitionMap::At(std::uint32_t number) const {
    return mEntries[number / kEntriesInPiece][number % kEntriesInPiece];
}

CMarkovTransitionMap::CEntry& CMarkovTransitionMap::At(std::uint32_t number) {
    return mEntries[number / kEntriesInPiece][number % kEntriesInPiece];
}

std::uint32_t CMarkovTransitionMap::AddEntry(std::uint32_t shorter, MarkovSequenceView history) {
    if (size() % kEntriesInPiece == 0) mEntries.emplace_back().reserve(kEntriesInPiece);
    const auto number = static_cast<std::uint32_t>(mSize++);
    CEntry& entry = mEntries.back().emplace_back();
    entry.mHistory = history;
    entry.mShorter = shorter;
    entry.mOldestClass = history.front()->mOrderClass;
    return number;
}

// The entries of a big model are not in the cache. Their addresses depend on the hashes alone, so
// the memory can bring all lengths at once.
void CMarkovTransitionMap::Fetch(MarkovSequenceView history) const {
#ifdef __GNUC__
    constexpr std::size_t most = 8;
    if (mSlots.empty()) return;
    std::array<std::size_t, most> places;
    const std::size_t lengths = std::min(most, history.size());
    const std::size_t mask = mSlots.size() - 1;
    std::uint32_t hash = 0;
    for (std::size_t ix = 0; ix < lengths; ++ix) {
        hash = Longer(hash, history[history.size() - 1 - ix]->mOrderClass);
        places[ix] = hash & mask;
        __builtin_prefetch(&mSlots[places[ix]]);
    }
    for (std::size_t ix = 0; ix < lengths; ++ix) {
        const std::uint32_t entry = mSlots[places[ix]].mEntry;
        if (entry != kNoEntry) __builtin_prefetch(&At(entry));
    }
#endif
}

void CMarkovTransitionMap::GrowSlots() {
    const std::vector<CSlot> old = std::move(mSlots);
    mSlots.assign(std::max(kFirstSlots, 2 * old.size()), {0, kNoEntry});
    const std::size_t mask = mSlots.size() - 1;
    for (const CSlot& slot : old) {
        if (slot.mEntry == kNoEntry) continue;
        std::size_t place = slot.mHash & mask;
        while (mSlots[place].mEntry != kNoEntry) place = (place + 1) & mask;
        mSlots[place] = slot;
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
