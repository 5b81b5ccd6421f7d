// SPDX-License-Identifier: MIT
#include "cli/DidYouMean.h"

#include "cli/Message.h"

#include "brindle/platform/Ascii.h"

#include <algorithm>
#include <array>
#include <numeric>

namespace brindle::cli {
namespace {

/// No word of the program is longer, so that n * m steps for two words stay few.
constexpr std::size_t kMostLetters = 40;

using TDistances = std::array<std::size_t, kMostLetters + 1>;

/// How many letters, large or small, are to be changed, added, left out or exchanged with the next
/// (optimal string alignment).
std::size_t EditDistance(std::string_view a, std::string_view b) {
    std::array<TDistances, 3> rows{};  // of the last two letters of a and of this one
    std::iota(rows[0].begin(), rows[0].end(), std::size_t{0});
    for (std::size_t i = 1; i <= a.size(); ++i) {
        const TDistances& twoBack = rows[(i + 1) % 3];
        const TDistances& back = rows[(i + 2) % 3];
        TDistances& row = rows[i % 3];
        row[0] = i;
        for (std::size_t k = 1; k <= b.size(); ++k) {
            const bool isSame = Ascii::ToLower(a[i - 1]) == Ascii::ToLower(b[k - 1]);
            const std::size_t changed = back[k - 1] + (isSame ? 0 : 1);
            row[k] = std::min({changed, back[k] + 1, row[k - 1] + 1});
            const bool isExchanged = i > 1 && k > 1 && a[i - 1] == b[k - 2] && a[i - 2] == b[k - 1];
            if (isExchanged) row[k] = std::min(row[k], twoBack[k - 2] + 1);
        }
    }
    return rows[a.size() % 3][b.size()];
}

}  // namespace

std::string NearestWord(std::string_view typed, const std::vector<std::string>& words) {
    constexpr std::size_t shortestBeginning = 3;
    if (typed.size() > kMostLetters) return {};
    std::string nearest;
    std::size_t least = (typed.size() + 2) / 3 + 1;
    for (const std::string& word : words) {
        if (word.size() > kMostLetters) continue;
        const bool isBegun = typed.size() >= shortestBeginning && word.starts_with(typed);
        const std::size_t distance = isBegun ? 0 : EditDistance(typed, word);
        if (distance >= least || distance >= word.size()) continue;
        least = distance;
        nearest = word;
    }
    return nearest;
}

std::string WithMeant(const std::string& problem, const std::string& meant) {
    if (meant.empty()) return problem;
    return Message("{problem}, did you mean {meant}?", {{"problem", problem}, {"meant", meant}});
}

}  // namespace brindle::cli
