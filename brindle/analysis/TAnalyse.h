// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

/// The route by which an analysis looks for harmonic centers. Any other value is like
/// `TAnalyse_None`.
enum TAnalyse : std::int32_t {
    /// No center is searched; merging and harmonic functions still run.
    TAnalyse_None = 0,
    /// Movements that end on a tonic (G7 C), then the weights.
    TAnalyse_TonicProgressions = 1,
    /// Cadences, then the weights.
    TAnalyse_CadenceProgressions = 2,
    /// Only the weights: which key holds most of the chords for the longest time.
    TAnalyse_CenterWeights = 3,
};

/// Whether a step looks only at centers whose key is undefined, or at all of them.
enum TOnlyUndefCenters : std::int32_t {
    TOnlyUndefCenters_Yes = 0,  ///< only those that nothing was found for
    TOnlyUndefCenters_No = 1,   ///< all
};

}  // namespace brindle
