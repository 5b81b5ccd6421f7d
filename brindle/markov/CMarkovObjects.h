// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CMarkovObject.h"

#include <boost/container/flat_map.hpp>
#include <boost/container/flat_set.hpp>

#include <cstdint>
#include <iosfwd>
#include <list>
#include <map>
#include <nlohmann/json_fwd.hpp>
#include <span>
#include <unordered_map>
#include <vector>

namespace brindle {

/// A symbol in the store of a model.
struct CMarkovStoredObject : CMarkovObject {
    /// Its place in the store, counted from 0.
    std::uint32_t mPlace = 0;
    /// The same for symbols that have one place in tables, see `operator<`: C sharp and D flat.
    std::uint32_t mOrderClass = 0;
};

/// Where a symbol stands in the store of its model; valid as long as that is not cleared.
using MarkovIterator = std::list<CMarkovStoredObject>::const_iterator;

/// The order of tables, which compare their symbols and never where these are stored.
struct CMarkovLess {
    /// Whether `a` comes before `b`, both of a store and not its end.
    bool operator()(MarkovIterator a, MarkovIterator b) const { return *a < *b; }
};

/// Symbols in the order of time.
using MarkovSequence = std::vector<MarkovIterator>;
/// The same without owning them.
using MarkovSequenceView = std::span<const MarkovIterator>;
/// The probability, or another weight, of each symbol. Filled in order, then asked.
using MarkovProbabilities = boost::container::flat_map<MarkovIterator, double, CMarkovLess>;
/// Symbols that order alike are one.
using MarkovSymbolSet = boost::container::flat_set<MarkovIterator, CMarkovLess>;

/// The store of symbols: a list without repetitions, in the order in which the symbols came.
///
/// Nothing is removed but by Clear, so iterators stay valid. A symbol is found by hash.
class CMarkovObjects {
public:
    CMarkovObjects() = default;
    // Tables hold iterators, so a copy would point into the list that it was made from.
    CMarkovObjects(const CMarkovObjects&) = delete;
    CMarkovObjects& operator=(const CMarkovObjects&) = delete;
    /// Symbols keep their iterators; the end of the list is another one then.
    CMarkovObjects(CMarkovObjects&&) = default;
    /// The same.
    CMarkovObjects& operator=(CMarkovObjects&&) = default;
    ~CMarkovObjects() = default;

    /// The symbol that equals `object` in all fields, appended if it was not there.
    MarkovIterator insertObjectIfUnique(const CMarkovObject& object);
    /// The same without appending: the end of the list if there is none.
    [[nodiscard]] MarkovIterator getIteratorToObject(const CMarkovObject& object) const;
    /// The symbol at a place counted from 0; the end of the list outside of it.
    [[nodiscard]] MarkovIterator At(std::int64_t place) const;

    /// The first symbol of the store.
    [[nodiscard]] MarkovIterator begin() const { return mList.begin(); }
    /// The end, which stands for "no symbol".
    [[nodiscard]] MarkovIterator end() const { return mList.end(); }
    /// How many symbols there are.
    [[nodiscard]] std::size_t size() const { return mList.size(); }
    /// Whether there is none.
    [[nodiscard]] bool empty() const { return mList.empty(); }
    /// Removes all symbols; every iterator is dead then.
    void Clear();

    /// An array of the symbols in list order.
    void AppendJSONString(std::ostream& stream) const;

    /// Reads the list from a dictionary.
    struct JSONDeserialization_Helper {
        /// Reads the array under "CMarkovObjects". Symbols that read as equal become one, so that
        /// the places behind them are one lower.
        [[nodiscard]] static CMarkovObjects CMarkovObjectsFromJSONDictionary(
            const nlohmann::json& dictionary);
    };

    /// The same symbols in the same order.
    friend bool operator==(const CMarkovObjects& a, const CMarkovObjects& b);

private:
    std::list<CMarkovStoredObject> mList;
    std::vector<MarkovIterator> mByPlace;
    std::unordered_multimap<std::size_t, MarkovIterator> mByHash;
    std::map<MarkovIterator, std::uint32_t, CMarkovLess> mOrderClasses;
};

}  // namespace brindle
