// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/internal/SheetDrawing.h"

#include <cstddef>

namespace brindle::LeadSheet {

inline constexpr double kLegendLineHeight = 18.0;

/// How many lines the legend takes at that width.
[[nodiscard]] std::size_t LegendLines(const CSheetScore& score, double width);

/// Samples of what the marks mean, of each that the score has, the base line of the first line at
/// `y`.
void DrawLegend(CSheetPen& pen, const CSheetScore& score, double x, double y, double width);

}  // namespace brindle::LeadSheet
