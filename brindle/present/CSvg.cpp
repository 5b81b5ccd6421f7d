// SPDX-License-Identifier: MIT
#include "brindle/present/CSvg.h"

#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

// The mean width of a letter in the usual sans-serif fonts, with some room to spare.
constexpr double kLetterWidth = 0.62;

constexpr std::string_view kEllipsis = "\xE2\x80\xA6";

}  // namespace

std::string SvgNumber(double value) {
    std::string text = fmt::format("{:.2f}", value);
    text.erase(text.find_last_not_of('0') + 1);
    if (text.back() == '.') text.pop_back();
    return text;
}

std::string XmlEscaped(std::string_view text) {
    std::string escaped;
    escaped.reserve(text.size());
    for (const char c : text) {
        switch (c) {
            case '&':
                escaped += "&amp;";
                break;
            case '<':
                escaped += "&lt;";
                break;
            case '>':
                escaped += "&gt;";
                break;
            case '"':
                escaped += "&quot;";
                break;
            default:
                escaped += c;
        }
    }
    return escaped;
}

std::string HslColor(int hue, int saturation, int lightness) {
    const double light = lightness / 100.0;
    const double strength = saturation / 100.0 * std::min(light, 1.0 - light);
    // One of the three parts: 0 for red, 8 for green, 4 for blue, in twelfths of the circle.
    const auto part = [&](int twelfths) {
        const double k = std::fmod(twelfths + hue / 30.0, 12.0);
        return std::lround(255.0 *
                           (light - strength * std::clamp(std::min(k - 3.0, 9.0 - k), -1.0, 1.0)));
    };
    return fmt::format("#{:02x}{:02x}{:02x}", part(0), part(8), part(4));
}

double TextWidth(std::string_view text, double fontSize) {
    return static_cast<double>(CountCharacters(text)) * fontSize * kLetterWidth;
}

void CSvg::Rect(double x, double y, double width, double height, std::string_view fill,
                std::string_view tooltip) {
    const std::string shape =
        fmt::format(R"(<rect x="{}" y="{}" width="{}" height="{}" rx="3" fill="{}")", SvgNumber(x),
                    SvgNumber(y), SvgNumber(width), SvgNumber(height), fill);
    mBody += shape;
    mBody += tooltip.empty() ? "/>\n" : "><title>" + XmlEscaped(tooltip) + "</title></rect>\n";
}

void CSvg::Line(double x1, double y1, double x2, double y2, std::string_view color) {
    mBody += fmt::format(R"(<line x1="{}" y1="{}" x2="{}" y2="{}" stroke="{}"/>)"
                         "\n",
                         SvgNumber(x1), SvgNumber(y1), SvgNumber(x2), SvgNumber(y2), color);
}

void CSvg::Circle(double x, double y, double radius, std::string_view fill, std::string_view line) {
    mBody += fmt::format(R"(<circle cx="{}" cy="{}" r="{}" fill="{}" stroke="{}"/>)"
                         "\n",
                         SvgNumber(x), SvgNumber(y), SvgNumber(radius), fill, line);
}

void CSvg::Text(double x, double y, std::string_view text, const CSvgFont& font) {
    mBody += fmt::format(R"(<text x="{}" y="{}" font-size="{}" fill="{}")", SvgNumber(x),
                         SvgNumber(y), SvgNumber(font.mSize), font.mColor);
    if (font.mBold) mBody += R"( font-weight="bold")";
    if (!font.mAnchor.empty()) mBody += fmt::format(R"( text-anchor="{}")", font.mAnchor);
    mBody += ">" + XmlEscaped(text) + "</text>\n";
}

void CSvg::TextCut(double x, double y, double width, std::string_view text, const CSvgFont& font) {
    if (TextWidth(text, font.mSize) <= width) return Text(x, y, text, font);
    const auto letters =
        static_cast<std::size_t>(std::max(0.0, width / TextWidth("x", font.mSize)));
    if (letters < 2) return;
    Text(x, y, FirstCharacters(text, letters - 1) + std::string(kEllipsis), font);
}

std::string CSvg::File(double width, double height, std::string_view title,
                       std::string_view description) const {
    const std::string w = SvgNumber(width);
    const std::string h = SvgNumber(height);
    std::string file = R"(<?xml version="1.0" encoding="UTF-8"?>)"
                       "\n";
    file += fmt::format(
        R"(<svg xmlns="http://www.w3.org/2000/svg" role="img" width="{0}" height="{1}" )"
        R"(viewBox="0 0 {0} {1}" font-family="DejaVu Sans, Verdana, Arial, sans-serif">)"
        "\n",
        w, h);
    file += "<title>" + XmlEscaped(title) + "</title>\n";
    if (!description.empty()) file += "<desc>" + XmlEscaped(description) + "</desc>\n";
    file += fmt::format(R"(<rect width="{}" height="{}" fill="#ffffff"/>)", w, h) + '\n';
    file += mBody;
    file += "</svg>\n";
    return file;
}

}  // namespace brindle
