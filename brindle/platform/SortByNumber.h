// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <span>
#include <utility>
#include <vector>

namespace brindle {

/// The places of numbers in ascending order, equal ones as they stand; empty if they ascend
/// already. None of them may be NaN.
[[nodiscard]] std::vector<std::size_t> AscendingOrder(std::span<const double> numbers);

/// Puts large records into ascending order of a number of each, which is not NaN; those with equal
/// numbers stay as they stand. Each record is moved once.
template <class Record, class NumberOf>
void SortByNumber(std::vector<Record>& records, NumberOf numberOf) {
    std::vector<double> numbers;
    numbers.reserve(records.size());
    for (const Record& record : records) numbers.push_back(numberOf(record));
    const std::vector<std::size_t> order = AscendingOrder(numbers);
    if (order.empty()) return;
    std::vector<Record> sorted;
    sorted.reserve(records.size());
    for (const std::size_t place : order) sorted.push_back(std::move(records[place]));
    records = std::move(sorted);
}

}  // namespace brindle
