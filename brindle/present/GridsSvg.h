// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CSvg.h"
#include "brindle/present/ChordGrid.h"

#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// From string to string of a diagram in full size, in pixels.
inline constexpr double kGridStringGap = 16.0;
/// From fret to fret, likewise.
inline constexpr double kGridFretGap = 20.0;

/// Draws a diagram without its name into a picture. `left` is the string on the left, `top` the
/// upper end of the strings; open and muted strings are marked above that. A diagram smaller than
/// full size shows no fingers.
void DrawGrid(CSvg& svg, const CChordGrid& grid, double left, double top, double scale,
              const CGridStyle& style = {});

/// A sheet of diagrams. Above them stand the lines of `head`, broken where the sheet ends; the
/// title is read out and not drawn.
[[nodiscard]] std::string GridsSvg(const std::vector<CChordGrid>& grids, std::string_view title,
                                   const CGridStyle& style = {},
                                   const std::vector<std::string>& head = {});

}  // namespace brindle
