// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

/// How the root of a chord is found when it is not known. Any value but 1 is the score.
enum TSingleChordAnalysisAlgo : std::int32_t {
    TSingleChordAnalysisAlgo_Score = 0,        ///< a table of points for each key
    TSingleChordAnalysisAlgo_NeuronalNet = 1,  ///< the trained net
};

}  // namespace brindle
