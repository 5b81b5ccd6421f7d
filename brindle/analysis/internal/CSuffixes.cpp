// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/CSuffixes.h"

#include <algorithm>
#include <bit>
#include <numeric>
#include <utility>

namespace brindle {

namespace {

// Fewer places than these are looked through one by one.
constexpr TPlace kFew = 16;

bool HasBit(TPlace place, std::size_t bit) {
    return (place >> bit & 1U) != 0;
}

/// Sorts `places` stably by `key` into `sorted`.
void SortByKey(const std::vector<TPlace>& places, const std::vector<TPlace>& key,
               std::vector<TPlace>& ends, std::vector<TPlace>& sorted) {
    std::fill(ends.begin(), ends.end(), 0);
    for (const TPlace k : key) ++ends[k];
    std::partial_sum(ends.begin(), ends.end(), ends.begin());
    for (auto place = places.rbegin(); place != places.rend(); ++place) {
        sorted[--ends[key[*place]]] = *place;
    }
}

}  // namespace

CSuffixes::CSuffixes(const std::vector<TPlace>& symbols) {
    if (symbols.empty()) return;
    SortSuffixes(symbols);
    CompareNeighbours(symbols);
    MakeMinima();
    SplitByBits();
}

void CSuffixes::SortSuffixes(const std::vector<TPlace>& symbols) {
    const auto count = static_cast<TPlace>(symbols.size());
    std::vector<TPlace> order(count);
    std::vector<TPlace> ends(count);
    std::vector<TPlace> newRanks(count);
    mPlaceOfRank.resize(count);
    mRankOfPlace = symbols;
    std::iota(order.begin(), order.end(), TPlace{0});
    SortByKey(order, mRankOfPlace, ends, mPlaceOfRank);
    for (TPlace known = 1; known < 2 * count; known *= 2) {
        const auto tailRank = [&](TPlace place) {
            return place + known < count ? mRankOfPlace[place + known] + 1 : 0;
        };
        // Sorted by the symbols behind the known ones: suffixes without any come first.
        const TPlace tailless = std::min(known, count);
        std::iota(order.begin(), order.begin() + tailless, count - tailless);
        auto next = order.begin() + tailless;
        for (const TPlace place : mPlaceOfRank) {
            if (place >= known) *next++ = place - known;
        }
        SortByKey(order, mRankOfPlace, ends, mPlaceOfRank);
        newRanks[mPlaceOfRank.front()] = 0;
        for (TPlace rank = 1; rank < count; ++rank) {
            const TPlace before = mPlaceOfRank[rank - 1];
            const TPlace place = mPlaceOfRank[rank];
            const bool isSame =
                mRankOfPlace[before] == mRankOfPlace[place] && tailRank(before) == tailRank(place);
            newRanks[place] = newRanks[before] + (isSame ? 0 : 1);
        }
        mRankOfPlace.swap(newRanks);
        if (mRankOfPlace[mPlaceOfRank.back()] == count - 1) return;
    }
}

// A suffix without its first symbol shares at least one symbol less with its own neighbour.
void CSuffixes::CompareNeighbours(const std::vector<TPlace>& symbols) {
    const TPlace count = Count();
    mShared.assign(1, std::vector<TPlace>(count, 0));
    TPlace shared = 0;
    for (TPlace place = 0; place < count; ++place) {
        const TPlace rank = mRankOfPlace[place];
        if (rank == 0) {
            shared = 0;
            continue;
        }
        const TPlace other = mPlaceOfRank[rank - 1];
        while (place + shared < count && other + shared < count &&
               symbols[place + shared] == symbols[other + shared]) {
            ++shared;
        }
        mShared.front()[rank] = shared;
        shared -= shared > 0 ? 1 : 0;
    }
}

void CSuffixes::MakeMinima() {
    for (TPlace half = 1; half < Count(); half *= 2) {
        const std::vector<TPlace>& halves = mShared.back();
        if (halves.size() <= half) return;
        std::vector<TPlace> minima(halves.size() - half);
        for (std::size_t rank = 0; rank < minima.size(); ++rank) {
            minima[rank] = std::min(halves[rank], halves[rank + half]);
        }
        mShared.push_back(std::move(minima));
    }
}

void CSuffixes::SplitByBits() {
    std::vector<TPlace> places = mPlaceOfRank;
    const auto bits = static_cast<std::size_t>(std::bit_width(Count()));
    mZerosBefore.resize(bits);
    for (std::size_t bit = bits; bit-- > 0;) {
        std::vector<TPlace>& zeros = mZerosBefore[bit];
        zeros.assign(places.size() + 1, 0);
        for (std::size_t n = 0; n < places.size(); ++n) {
            zeros[n + 1] = zeros[n] + (HasBit(places[n], bit) ? 0 : 1);
        }
        std::stable_partition(places.begin(), places.end(),
                              [&](TPlace place) { return !HasBit(place, bit); });
    }
}

TPlace CSuffixes::EqualCount(TPlace a, TPlace b) const {
    if (a == b) return Count() - a;
    const auto [low, high] = std::minmax(mRankOfPlace[a], mRankOfPlace[b]);
    const auto level = static_cast<std::size_t>(std::bit_width(high - low) - 1);
    const std::vector<TPlace>& minima = mShared[level];
    return std::min(minima[low + 1], minima[high + 1 - (TPlace{1} << level)]);
}

CRanks CSuffixes::RanksOfPassage(TPlace place, TPlace count) const {
    CRanks ranks{mRankOfPlace[place], mRankOfPlace[place] + 1};
    for (std::size_t level = mShared.size(); level-- > 0;) {
        const TPlace step = TPlace{1} << level;
        // The entry of a rank compares it with the rank before, and nothing is before rank 0.
        if (ranks.mFirst >= step && mShared[level][ranks.mFirst + 1 - step] >= count) {
            ranks.mFirst -= step;
        }
        if (Count() - ranks.mEnd >= step && mShared[level][ranks.mEnd] >= count) {
            ranks.mEnd += step;
        }
    }
    return ranks;
}

CRanks CSuffixes::Zeros(std::size_t level, CRanks ranks) const {
    return {mZerosBefore[level][ranks.mFirst], mZerosBefore[level][ranks.mEnd]};
}

CRanks CSuffixes::Ones(std::size_t level, CRanks ranks) const {
    const CRanks zeros = Zeros(level, ranks);
    const TPlace allZeros = mZerosBefore[level].back();
    return {allZeros + ranks.mFirst - zeros.mFirst, allZeros + ranks.mEnd - zeros.mEnd};
}

/// The smallest of the places that are left at a level, whose higher bits are equal.
TPlace CSuffixes::SmallestPlace(std::size_t level, CRanks ranks) const {
    TPlace lowBits = 0;
    while (level-- > 0) {
        const CRanks zeros = Zeros(level, ranks);
        if (zeros.size() == 0) lowBits |= TPlace{1} << level;
        ranks = zeros.size() == 0 ? Ones(level, ranks) : zeros;
    }
    return lowBits;
}

TPlace CSuffixes::NextPlace(CRanks ranks, TPlace place) const {
    if (ranks.size() <= kFew) {
        TPlace next = kNoPlace;
        for (TPlace rank = ranks.mFirst; rank < ranks.mEnd; ++rank) {
            if (mPlaceOfRank[rank] >= place) next = std::min(next, mPlaceOfRank[rank]);
        }
        return next;
    }
    if (place >= Count()) return kNoPlace;
    // Follows the bits of `place`, and remembers the last turn to greater places.
    std::size_t turn = 0;
    CRanks greater;
    for (std::size_t level = mZerosBefore.size(); level-- > 0;) {
        const CRanks ones = Ones(level, ranks);
        if (HasBit(place, level)) {
            ranks = ones;
        } else {
            if (ones.size() > 0) {
                turn = level;
                greater = ones;
            }
            ranks = Zeros(level, ranks);
        }
        if (ranks.size() == 0) break;
    }
    if (ranks.size() > 0) return place;
    if (greater.size() == 0) return kNoPlace;
    const TPlace highBits = place >> turn << turn;
    return highBits | TPlace{1} << turn | SmallestPlace(turn, greater);
}

}  // namespace brindle
