// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace brindle {

/// The text with what XML reserves written as entities.
[[nodiscard]] std::string XmlEscaped(std::string_view text);

/// A color as "#rrggbb"; `hue` in degrees, the others in percent.
[[nodiscard]] std::string HslColor(int hue, int saturation, int lightness);

/// A coordinate with at most two digits behind the point, which are finer than any screen.
[[nodiscard]] std::string SvgNumber(double value);

/// How a text is written into a picture.
struct CSvgFont {
    double mSize = 12.0;                  ///< height of the letters in pixels
    std::string_view mColor = "#222222";  ///< as in CSS; not owned
    bool mBold = false;                   ///< thick letters
    /// "middle" or "end": where the text has its x; its start otherwise.
    std::string_view mAnchor = {};
};

/// About how wide the text is; the viewer's font decides.
[[nodiscard]] double TextWidth(std::string_view text, double fontSize);

/// A picture that is put together from rectangles, lines and texts. Sizes are in pixels.
class CSvg {
public:
    /// Rounded a little; `tooltip` is shown where the pointer rests, empty for none.
    void Rect(double x, double y, double width, double height, std::string_view fill,
              std::string_view tooltip = {});
    /// One pixel wide.
    void Line(double x1, double y1, double x2, double y2, std::string_view color);
    /// Filled, with a line of one pixel around it.
    void Circle(double x, double y, double radius, std::string_view fill, std::string_view line);
    /// `y` is the line that the letters stand on.
    void Text(double x, double y, std::string_view text, const CSvgFont& font);
    /// Writes as much of the text as fits into the width.
    void TextCut(double x, double y, double width, std::string_view text, const CSvgFont& font);

    /// The whole file, an image to screen readers, which read out `title` and `description`; an
    /// empty description is left out.
    [[nodiscard]] std::string File(double width, double height, std::string_view title,
                                   std::string_view description = {}) const;

private:
    std::string mBody;
};

}  // namespace brindle
