// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovObjects.h"

#include <cstdint>
#include <vector>

namespace brindle {

/// Translates between symbols of a store and their places in it, for one model file.
///
/// Symbols that order alike have one index: that of the one which was asked for first.
class CIteratorIndexConverter {
public:
    /// The store must outlive the converter.
    explicit CIteratorIndexConverter(const CMarkovObjects& objects) : mObjects(objects) {}

    /// The index of a symbol, from 0: its place in the store, or that of an earlier one that orders
    /// alike.
    [[nodiscard]] int InsertIfUniqueAndReturnIndex(MarkovIterator symbol);
    /// The end of the store for an index outside of it.
    [[nodiscard]] MarkovIterator InsertIfUniqueAndReturnPointer(int index) const {
        return mObjects.At(index);
    }
    /// Whether it is the end of the store, and so no symbol.
    [[nodiscard]] bool IsEnd(MarkovIterator symbol) const { return symbol == mObjects.end(); }

private:
    const CMarkovObjects& mObjects;
    /// By order class; -1 for one that was not asked for.
    std::vector<int> mIndices;
};

}  // namespace brindle
