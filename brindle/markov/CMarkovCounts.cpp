// SPDX-License-Identifier: MIT
#include "brindle/markov/CMarkovCounts.h"

#include <algorithm>
#include <bit>

namespace brindle {
namespace {

bool ComesBefore(const CMarkovCounts::TCount& a, const CMarkovCounts::TCount& b) {
    return CMarkovLess()(a.first, b.first);
}

}  // namespace

std::uint32_t& CMarkovCounts::operator[](MarkovIterator symbol) {
    const TCount wanted(symbol, 0);
    auto place = mPairs.begin();
    for (std::size_t start = 0; start < mPairs.size();) {
        const std::size_t length = RunAt(start, mPairs.size());
        const auto run = mPairs.begin() + static_cast<std::ptrdiff_t>(start);
        const auto end = run + static_cast<std::ptrdiff_t>(length);
        place = std::lower_bound(run, end, wanted, ComesBefore);
        if (place != end && !ComesBefore(wanted, *place)) return place->second;
        start += length;
    }
    if (mPairs.size() % kBlock == 0) place = mPairs.end();
    const auto added = mPairs.insert(place, wanted);
    if (mPairs.size() % kBlock != 0 || mPairs.size() == kBlock) return added->second;
    MergeLastRuns();
    return (*this)[symbol];
}

// The length of the run that starts there.
std::size_t CMarkovCounts::RunAt(std::size_t start, std::size_t size) {
    const std::size_t blocks = (size - start) / kBlock;
    return blocks == 0 ? size - start : std::bit_floor(blocks) * kBlock;
}

// Behind a block that became full: as adding 1 to a binary number carries.
void CMarkovCounts::MergeLastRuns() {
    const std::size_t merged = std::size_t{1} << std::countr_zero(mPairs.size() / kBlock);
    for (std::size_t blocks = 1; blocks < merged; blocks *= 2) {
        const auto middle = mPairs.end() - static_cast<std::ptrdiff_t>(blocks * kBlock);
        std::inplace_merge(middle - static_cast<std::ptrdiff_t>(blocks * kBlock), middle,
                           mPairs.end(), ComesBefore);
    }
}

// From the shortest run on, so that all merges together cost no more than twice the last one. What
// is in order as a whole is also in order by runs.
void CMarkovCounts::PutInOrder() const {
    std::size_t start = mPairs.size() / kBlock * kBlock;
    for (std::size_t blocks = mPairs.size() / kBlock; blocks != 0; blocks &= blocks - 1) {
        const auto middle = mPairs.begin() + static_cast<std::ptrdiff_t>(start);
        start -= (blocks & (~blocks + 1)) * kBlock;
        const bool isInOrder = middle == mPairs.end() || !ComesBefore(*middle, *(middle - 1));
        if (isInOrder) continue;
        std::inplace_merge(mPairs.begin() + static_cast<std::ptrdiff_t>(start), middle,
                           mPairs.end(), ComesBefore);
    }
}

}  // namespace brindle
