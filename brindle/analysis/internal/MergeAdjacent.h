// SPDX-License-Identifier: MIT
#pragma once

#include <iterator>
#include <utility>

namespace brindle {

/// Joins each element for which `same(kept, element)` holds into the kept element before it with
/// `join(kept, element)`, and drops it. One pass, whatever the number of joins.
template <class TList, class TSame, class TJoin>
void MergeAdjacent(TList& list, TSame same, TJoin join) {
    if (list.size() < 2) return;
    auto kept = list.begin();
    for (auto next = std::next(kept); next != list.end(); ++next) {
        if (same(*kept, *next)) {
            join(*kept, *next);
        } else if (++kept != next) {
            *kept = std::move(*next);
        }
    }
    list.erase(std::next(kept), list.end());
}

}  // namespace brindle
