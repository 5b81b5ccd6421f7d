// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <vector>

namespace brindle {

/// The way through rows of choices whose sum of costs is the lowest (Viterbi's search): one choice
/// in each row. `rows` is a list of lists; `costOf(choice)` is what a choice costs by itself,
/// `costOfStep(choice, next)` what it costs to go from a choice to one of the next row. A row
/// without choices is stepped over; its place in the result is 0. At equal costs the earlier choice
/// wins. Time grows with the rows times the square of the choices in a row.
template <class Rows, class CostOf, class CostOfStep>
[[nodiscard]] std::vector<std::size_t> CheapestPath(const Rows& rows, CostOf costOf,
                                                    CostOfStep costOfStep) {
    using TCost = decltype(costOf(*std::begin(*std::begin(rows))));
    std::vector<std::vector<std::size_t>> origins(rows.size());
    std::vector<std::size_t> rowsBefore(rows.size(), rows.size());
    std::vector<TCost> costs;
    std::vector<TCost> costsBefore;
    std::size_t before = rows.size();  // none yet
    for (std::size_t row = 0; row < rows.size(); ++row) {
        if (rows[row].empty()) continue;
        rowsBefore[row] = before;
        costs.clear();
        for (const auto& choice : rows[row]) {
            std::size_t origin = 0;
            TCost best = 0;
            for (std::size_t from = 0; from < costsBefore.size(); ++from) {
                const TCost sum = costsBefore[from] + costOfStep(rows[before][from], choice);
                if (from == 0 || sum < best) origin = from;
                if (from == 0 || sum < best) best = sum;
            }
            origins[row].push_back(origin);
            costs.push_back(best + costOf(choice));
        }
        costsBefore = costs;
        before = row;
    }
    std::vector<std::size_t> path(rows.size(), 0);
    std::size_t choice = 0;
    for (std::size_t ix = 1; ix < costsBefore.size(); ++ix) {
        if (costsBefore[ix] < costsBefore[choice]) choice = ix;
    }
    for (std::size_t row = before; row < rows.size(); row = rowsBefore[row]) {
        path[row] = choice;
        choice = origins[row][choice];
    }
    return path;
}

}  // namespace brindle
