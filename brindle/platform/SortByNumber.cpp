// SPDX-License-Identifier: MIT
#include "brindle/platform/SortByNumber.h"

#include <algorithm>
#include <numeric>

namespace brindle {

std::vector<std::size_t> AscendingOrder(std::span<const double> numbers) {
    if (std::is_sorted(numbers.begin(), numbers.end())) return {};
    std::vector<std::size_t> order(numbers.size());
    std::iota(order.begin(), order.end(), std::size_t{0});
    std::stable_sort(order.begin(), order.end(),
                     [&](std::size_t a, std::size_t b) { return numbers[a] < numbers[b]; });
    return order;
}

}  // namespace brindle
