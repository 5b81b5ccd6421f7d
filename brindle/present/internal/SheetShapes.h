// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/internal/SheetMarks.h"
#include "brindle/present/internal/SheetPen.h"

namespace brindle::LeadSheet {

// Signs of a lead sheet that are drawn by hand, as few fonts have them.

/// From one chord to another, on the line `base`. What begins or goes on in another line fades at
/// the height of its arc.
void DrawArrow(CSheetPen& pen, double begin, double end, double base, double rise,
               const CLinkMark& arrow);

/// Around a middle.
void DrawCodaSign(CSheetPen& pen, double x, double y);
void DrawSegnoSign(CSheetPen& pen, double x, double y);

/// Of a bar that goes on with its chord; `middle` is the height of its middle.
void DrawSlash(CSheetPen& pen, double x, double middle);

}  // namespace brindle::LeadSheet
