// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/internal/SheetText.h"

#include <string>
#include <string_view>

namespace brindle::LeadSheet {

/// Writes the shapes of a lead sheet. Colors and fonts are those of style classes.
class CSheetPen {
public:
    void Rect(double x, double y, double width, double height, std::string_view style);
    void Line(double x1, double y1, double x2, double y2, std::string_view style);
    void Dot(double x, double y, double radius, std::string_view style);
    /// `path` in the language of SVG.
    void Path(std::string_view path, std::string_view style);
    /// `anchor` as in SVG; empty for the start of the text.
    void Text(double x, double y, double size, std::string_view text, std::string_view style,
              std::string_view anchor = {});
    void Runs(double x, double y, double size, const CTextRuns& runs, std::string_view style);

    [[nodiscard]] const std::string& Body() const { return mBody; }

private:
    std::string mBody;
};

}  // namespace brindle::LeadSheet
