// SPDX-License-Identifier: MIT
#include "brindle/present/internal/SheetShapes.h"

#include "brindle/present/CSvg.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

namespace brindle::LeadSheet {
namespace {

// The way of the arrow at its end is (across, down).
void DrawArrowHead(CSheetPen& pen, double x, double y, double across, double down) {
    constexpr double kLength = 6.5;
    constexpr double kHalfWidth = 2.3;
    const double length = std::max(1e-3, std::hypot(across, down));
    const double dx = across / length;
    const double dy = down / length;
    const double baseX = x - kLength * dx;
    const double baseY = y - kLength * dy;
    pen.Path(fmt::format("M{} {}L{} {}L{} {}z", SvgNumber(x + dx), SvgNumber(y + dy),
                         SvgNumber(baseX - kHalfWidth * dy), SvgNumber(baseY + kHalfWidth * dx),
                         SvgNumber(baseX + kHalfWidth * dy), SvgNumber(baseY - kHalfWidth * dx)),
             "head");
}

}  // namespace

void DrawArrow(CSheetPen& pen, double begin, double end, double base, double rise,
               const CLinkMark& arrow) {
    const double top = base - 0.75 * rise;
    const double bend = std::min(22.0, 0.36 * (end - begin));
    const std::string_view style = arrow.mIsDotted ? "dot" : "arc";
    const bool fades = arrow.mGoesOn || arrow.mGoesBack;
    const double beginY = arrow.mIsFromBefore ? top : base;
    const double endY = fades ? top : base;
    const double beginTop = arrow.mIsFromBefore ? top : base - rise;
    const double endTop = fades ? top : base - rise;
    pen.Path(fmt::format("M{} {}C{} {} {} {} {} {}", SvgNumber(begin), SvgNumber(beginY),
                         SvgNumber(begin + bend), SvgNumber(beginTop), SvgNumber(end - bend),
                         SvgNumber(endTop), SvgNumber(end), SvgNumber(endY)),
             style);
    if (arrow.mGoesOn) return;
    DrawArrowHead(pen, end, endY, bend, endY - endTop);
}

void DrawCodaSign(CSheetPen& pen, double x, double y) {
    pen.Path(fmt::format("M{0} {1}a3.6 4.6 0 1 0 7.2 0a3.6 4.6 0 1 0 -7.2 0", SvgNumber(x - 3.6),
                         SvgNumber(y)),
             "bar");
    pen.Line(x - 6.2, y, x + 6.2, y, "bar");
    pen.Line(x, y - 7.2, x, y + 7.2, "bar");
}

void DrawSegnoSign(CSheetPen& pen, double x, double y) {
    pen.Path(fmt::format("M{} {}c-2 -3 -7 -1.5 -4.5 1.8c1.6 2 7.4 1.6 9 3.6c2.5 3.3 -2.5 4.8 "
                         "-4.5 1.8",
                         SvgNumber(x), SvgNumber(y - 3.6)),
             "bar");
    pen.Line(x - 4.6, y + 6.6, x + 4.6, y - 6.6, "bar");
    pen.Dot(x - 4.6, y + 1.2, 1.1, "ink");
    pen.Dot(x + 4.6, y - 1.2, 1.1, "ink");
}

void DrawSlash(CSheetPen& pen, double x, double middle) {
    pen.Path(fmt::format("M{} {}l8 -14h4l-8 14z", SvgNumber(x - 6), SvgNumber(middle + 7)),
             "quiet");
}

}  // namespace brindle::LeadSheet
