// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/internal/SheetMarks.h"
#include "brindle/present/internal/SheetPen.h"

namespace brindle::LeadSheet {

/// What stands on the lines of a lead sheet.
struct CSheetScore {
    CSheet mSheet;
    std::vector<CChordTexts> mTexts;
    CSheetLines mLines;
    std::vector<CLineMarks> mMarks;
};

/// The height of a line with the gap below it.
[[nodiscard]] double HeightOf(const CSheetScore& score, std::size_t line);

/// Draws a line whose upper left corner is there.
void DrawLine(CSheetPen& pen, const CSheetScore& score, std::size_t line, double x, double y);

inline constexpr double kLegendLineHeight = 18.0;

/// How many lines the legend takes at that width.
[[nodiscard]] std::size_t LegendLines(const CSheetScore& score, double width);

/// Samples of what the marks mean, of each that the score has, the base line of the first line at
/// `y`.
void DrawLegend(CSheetPen& pen, const CSheetScore& score, double x, double y, double width);

}  // namespace brindle::LeadSheet
