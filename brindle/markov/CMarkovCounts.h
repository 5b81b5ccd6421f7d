// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovObjects.h"

#include <boost/container/small_vector.hpp>

#include <cstddef>
#include <cstdint>
#include <utility>

namespace brindle {

/// How often each symbol followed, in the order of the symbols. Of symbols that order alike the one
/// that came first is shown. Adding S symbols takes S log S steps, in whatever order they come.
///
/// Most histories of a big model have one continuation, which needs no memory of its own.
class CMarkovCounts {
public:
    /// A symbol and how often it followed.
    using TCount = std::pair<MarkovIterator, std::uint32_t>;
    /// All of them, in the order of the symbols.
    using TPairs = boost::container::small_vector<TCount, 1>;

    /// The count of a symbol, from 0; valid until another symbol is counted or read.
    std::uint32_t& operator[](MarkovIterator symbol);

    /// The number of symbols that were counted.
    [[nodiscard]] std::size_t size() const { return mPairs.size(); }
    /// Whether none was.
    [[nodiscard]] bool empty() const { return mPairs.empty(); }
    /// Reading may put the symbols in order: like adding, it is for one thread at a time.
    [[nodiscard]] TPairs::const_iterator begin() const {
        if (mPairs.size() > kBlock) PutInOrder();
        return mPairs.begin();
    }
    /// The end of the same.
    [[nodiscard]] TPairs::const_iterator end() const { return mPairs.end(); }

private:
    static constexpr std::size_t kBlock = 64;

    [[nodiscard]] static std::size_t RunAt(std::size_t start, std::size_t size);
    void MergeLastRuns();
    void PutInOrder() const;

    /// Runs that are sorted each. The lengths of all but the last one are kBlock times the powers
    /// of two in size / kBlock, the largest first; the last one has the rest.
    mutable TPairs mPairs;
};

/// The name under which models use them.
using MarkovCounts = CMarkovCounts;

}  // namespace brindle
