// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Song.h"
#include "cli/Svg.h"
#include "cli/TimeAxis.h"

#include <vector>

namespace brindle::cli {

/// Where the band of the repeated passages lies in a picture, in pixels.
struct TCopiesBand {
    double mLeft = 0.0;
    const std::vector<double>& mLineTops;
    /// From the top of a line of the song.
    double mTop = 0.0;
    double mHeight = 0.0;
};

/// Draws a thin band under each passage that repeats an earlier one; it says which bars it repeats,
/// and all that repeat the same ones have one color.
void DrawCopies(CSvg& svg, const CTimeAxis& axis, const TCopiesBand& band, const TSong& song);

}  // namespace brindle::cli
