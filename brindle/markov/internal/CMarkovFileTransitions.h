// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/markov/CIteratorIndexConverter.h"
#include "brindle/markov/CMarkovTransitionMap.h"

#include <cstdint>
#include <nlohmann/json_fwd.hpp>
#include <vector>

namespace brindle {

/// Models whose histories are longer are not read: a file of some megabytes could otherwise make
/// counts without end, one for each length and symbol.
inline constexpr int kMarkovLongestHistoryInFile = 256;

/// The entries of "TransitionMap" in a model file, as numbers. They take a fraction of the room
/// that the JSON takes, so that a reader can let go of that entry by entry.
class CMarkovFileTransitions {
public:
    /// `entry` is `[[h1,h2,...],[[s,c],[s,c],...]]`. What has another form is left out; a history
    /// stays in the map also when no successor is left.
    void Add(const nlohmann::json& entry);
    void Clear() { mNumbers.clear(); }

    /// The map with all shorter histories. Entries and successors whose index names no symbol are
    /// left out, and so are entries of more than kMarkovLongestHistoryInFile symbols.
    [[nodiscard]] CMarkovTransitionMap ToMap(const CIteratorIndexConverter& converter) const;

private:
    /// Each entry: the length of its history, the number of its pairs, the history, the pairs.
    std::vector<std::uint32_t> mNumbers;
};

/// The index that a JSON value holds; -1 for one that can be no index.
[[nodiscard]] int MarkovIndexOf(const nlohmann::json& value);

}  // namespace brindle
