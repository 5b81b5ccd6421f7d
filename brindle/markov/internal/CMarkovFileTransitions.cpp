// SPDX-License-Identifier: MIT
#include "brindle/markov/internal/CMarkovFileTransitions.h"

#include <algorithm>
#include <limits>
#include <nlohmann/json.hpp>

namespace brindle {
namespace {

using nlohmann::json;

bool IsSuccessor(const json& pair) {
    return pair.is_array() && pair.size() >= 2 && pair[0].is_number_integer() &&
           pair[1].is_number_integer();
}

bool IsEntry(const json& entry) {
    return entry.is_array() && !entry.empty() && entry[0].is_array();
}

/// The successors of an entry, none if there is no list of them.
const json& SuccessorsOf(const json& entry) {
    static const json none = json::array();
    return entry.size() >= 2 && entry[1].is_array() ? entry[1] : none;
}

}  // namespace

int MarkovIndexOf(const json& value) {
    if (!value.is_number_integer()) return -1;
    const auto index = value.get<std::int64_t>();
    return index < 0 || index > std::numeric_limits<int>::max() ? -1 : static_cast<int>(index);
}

void CMarkovFileTransitions::Add(const json& entry) {
    if (!IsEntry(entry)) return;
    const json& successors = SuccessorsOf(entry);
    const auto pairs = static_cast<std::uint32_t>(
        std::count_if(successors.begin(), successors.end(), IsSuccessor));
    mNumbers.push_back(static_cast<std::uint32_t>(entry[0].size()));
    mNumbers.push_back(pairs);
    for (const json& index : entry[0]) {
        mNumbers.push_back(static_cast<std::uint32_t>(MarkovIndexOf(index)));
    }
    for (const json& pair : successors) {
        if (!IsSuccessor(pair)) continue;
        mNumbers.push_back(static_cast<std::uint32_t>(MarkovIndexOf(pair[0])));
        mNumbers.push_back(static_cast<std::uint32_t>(pair[1].get<std::uint64_t>()));
    }
}

CMarkovTransitionMap CMarkovFileTransitions::ToMap(const CIteratorIndexConverter& converter) const {
    CMarkovTransitionMap map;
    MarkovSequence history;
    auto number = mNumbers.begin();
    const auto nextSymbol = [&] {
        return converter.InsertIfUniqueAndReturnPointer(static_cast<int>(*number++));
    };
    while (number != mNumbers.end()) {
        const std::uint32_t length = *number++;
        const std::uint32_t pairs = *number++;
        history.resize(length);
        std::generate(history.begin(), history.end(), nextSymbol);
        const bool isKnown =
            length <= kMarkovLongestHistoryInFile &&
            std::none_of(history.begin(), history.end(),
                         [&](MarkovIterator symbol) { return converter.IsEnd(symbol); });
        if (isKnown) map.AddHistory(history);
        for (std::uint32_t pair = 0; pair < pairs; ++pair) {
            const MarkovIterator symbol = nextSymbol();
            const std::uint32_t count = *number++;
            if (isKnown && !converter.IsEnd(symbol)) map.AddToAllLengths(history, symbol, count);
        }
    }
    return map;
}

}  // namespace brindle
