// SPDX-License-Identifier: MIT
#include "brindle/present/CBars.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle {

std::string BarsOf(const CTimeRange& range, const CBars& bars) {
    const long first = bars.BarOf(range.mBegin);
    // A range that ends on a bar line does not reach into the bar behind it.
    const long last = std::max(first, bars.LastBarBefore(range.mEnd));
    return first == last ? fmt::format("bar {}", first) : fmt::format("bars {} to {}", first, last);
}

}  // namespace brindle
