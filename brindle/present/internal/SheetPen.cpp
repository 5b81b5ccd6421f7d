// SPDX-License-Identifier: MIT
#include "brindle/present/internal/SheetPen.h"

#include "brindle/present/CSvg.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

namespace brindle::LeadSheet {

void CSheetPen::Rect(double x, double y, double width, double height, std::string_view style) {
    mBody += fmt::format("<rect class=\"{}\" x=\"{}\" y=\"{}\" width=\"{}\" height=\"{}\"/>\n",
                         style, SvgNumber(x), SvgNumber(y), SvgNumber(width), SvgNumber(height));
}

void CSheetPen::Line(double x1, double y1, double x2, double y2, std::string_view style) {
    mBody += fmt::format("<line class=\"{}\" x1=\"{}\" y1=\"{}\" x2=\"{}\" y2=\"{}\"/>\n", style,
                         SvgNumber(x1), SvgNumber(y1), SvgNumber(x2), SvgNumber(y2));
}

void CSheetPen::Dot(double x, double y, double radius, std::string_view style) {
    mBody += fmt::format("<circle class=\"{}\" cx=\"{}\" cy=\"{}\" r=\"{}\"/>\n", style,
                         SvgNumber(x), SvgNumber(y), SvgNumber(radius));
}

void CSheetPen::Path(std::string_view path, std::string_view style) {
    mBody += fmt::format("<path class=\"{}\" d=\"{}\"/>\n", style, path);
}

void CSheetPen::Text(double x, double y, double size, std::string_view text, std::string_view style,
                     std::string_view anchor) {
    mBody += fmt::format("<text class=\"{}\" x=\"{}\" y=\"{}\" font-size=\"{}\"", style,
                         SvgNumber(x), SvgNumber(y), SvgNumber(size));
    if (!anchor.empty()) mBody += fmt::format(" text-anchor=\"{}\"", anchor);
    mBody += ">" + XmlEscaped(Printable(text)) + "</text>\n";
}

void CSheetPen::Runs(double x, double y, double size, const CTextRuns& runs,
                     std::string_view style) {
    mBody += fmt::format("<text class=\"{}\" x=\"{}\" y=\"{}\" font-size=\"{}\">", style,
                         SvgNumber(x), SvgNumber(y), SvgNumber(size));
    double raise = 0.0;
    for (const CTextRun& run : runs) {
        const std::string text = XmlEscaped(run.mText);
        if (run.mSize == 1.0 && run.mRaise == raise) {
            mBody += text;
            continue;
        }
        mBody += "<tspan";
        if (run.mSize != 1.0)
            mBody += fmt::format(" font-size=\"{}\"", SvgNumber(size * run.mSize));
        if (run.mRaise != raise) {
            mBody += fmt::format(" dy=\"{}\"", SvgNumber(size * (raise - run.mRaise)));
        }
        raise = run.mRaise;
        mBody += ">" + text + "</tspan>";
    }
    mBody += "</text>\n";
}

}  // namespace brindle::LeadSheet
