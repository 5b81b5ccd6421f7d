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

}  // namespace brindle::LeadSheet
