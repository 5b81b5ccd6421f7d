// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/SongShapes.h"

namespace brindle {

/// Draws a thin band under each passage that repeats an earlier one; it says which bars it repeats,
/// and all that repeat the same ones have one color. `top` counts from the top of a line.
void DrawCopies(CSvg& svg, const CTimeAxis& axis, const CLinePlaces& places, const CShownSong& song,
                double top, double height);

}  // namespace brindle
