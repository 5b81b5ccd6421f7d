// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/neural/ChordRootPatterns.h"

#include <span>
#include <string>
#include <vector>

namespace brindle::tools {

/// The roots that one method hears: for each pattern the semitones above the lowest note.
struct CHeardRoots {
    std::string mMethod;
    std::vector<int> mRootIntvls;
};

/// The roots that the net with these weights hears.
[[nodiscard]] CHeardRoots HeardByNet(std::span<const CChordRootPattern> patterns,
                                     std::span<const double> weights);
/// The roots that the score finds, for the same notes upwards from C.
[[nodiscard]] CHeardRoots FoundByScore(std::span<const CChordRootPattern> patterns);

/// How far the right output of the net stands above the others, at least.
[[nodiscard]] double LeastMargin(std::span<const CChordRootPattern> patterns,
                                 std::span<const double> weights);

/// Tables in Markdown: how many patterns each method gets right, by group and by shape, and each
/// pattern that the first method gets wrong.
[[nodiscard]] std::string FiguresText(std::span<const CChordRootPattern> patterns,
                                      std::span<const CHeardRoots> heard);

}  // namespace brindle::tools
