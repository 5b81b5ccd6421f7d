// SPDX-License-Identifier: MIT
#include "brindle/present/SongShapes.h"

#include "brindle/present/KeyColor.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle {
namespace {

constexpr double kPaddingOfChords = 5.0;
constexpr double kGapOfChords = 1.0;
constexpr double kChordHeight = 34.0;
constexpr double kNarrowestChord = 40.0;
// From the middle of a line of text to its base, in parts of the font's size.
constexpr double kBaseLine = 0.36;
constexpr double kKeyNoteHeight = 18.0;
constexpr std::string_view kInkOfBarLines = "#c8c8c8";

double WidthInside(const CTimeSegment& segment) {
    return std::max(0.5, segment.Width() - 2 * kGapOfChords);
}

}  // namespace

void DrawBarLines(CSvg& svg, const CTimeAxis& axis, const CLinePlaces& places, double bottom) {
    for (std::size_t line = 0; line < axis.LineCount(); ++line) {
        const double top = places.mTops[line];
        for (const auto& [barX, bar] : axis.BarLines(line)) {
            const double x = places.mLeft + barX;
            svg.Line(x, top + 4, x, top + bottom, kInkOfBarLines);
            svg.Text(x + 3, top + 13, fmt::format("{}", bar),
                     {.mSize = kSmallSize, .mColor = kFaintInk});
        }
        const double right = places.mLeft + axis.Line(line).mRight;
        svg.Line(right, top + 4, right, top + bottom, kInkOfBarLines);
    }
}

void DrawBand(CSvg& svg, const CTimeAxis& axis, const CLinePlaces& places, const CTimeRange& range,
              const CBand& band) {
    for (const CTimeSegment& segment : axis.SegmentsOf(range)) {
        const double x = places.mLeft + segment.mLeft + kGapOfChords;
        const double y = places.mTops[segment.mLine] + band.mTop;
        svg.Rect(x, y, WidthInside(segment), band.mHeight, band.mColor, band.mLabel);
        svg.TextCut(x + kPaddingOfChords, y + band.mHeight / 2 + band.mFont.mSize * kBaseLine,
                    segment.Width() - kPaddingOfChords, band.mLabel, band.mFont);
    }
}

void DrawKeyRegions(CSvg& svg, const CTimeAxis& axis, const CLinePlaces& places,
                    const CShownKeys& keys, double top, double height) {
    for (const CShownKeyRegion& region : keys.mRegions) {
        DrawBand(svg, axis, places, region.mRange,
                 {top,
                  height,
                  ColorOf(region.mKey, Shade_Region),
                  "in " + region.mName,
                  {.mSize = kLabelSize, .mBold = region.mKey == keys.mKey}});
    }
}

double HeightOfKeyNotes(const CShownKeys& keys) {
    return kKeyNoteHeight * static_cast<double>(keys.mNotes.size());
}

void DrawKeyNotes(CSvg& svg, const CShownKeys& keys, double left, double top, double width) {
    for (const std::string& note : keys.mNotes) {
        svg.TextCut(left, top + kLabelSize, width, note,
                    {.mSize = kLabelSize, .mColor = kFaintInk});
        top += kKeyNoteHeight;
    }
}

void DrawChord(CSvg& svg, const CTimeAxis& axis, const CLinePlaces& places, const CTimeRange& range,
               const CChordBox& box) {
    const std::vector<CTimeSegment> segments = axis.SegmentsOf(range);
    for (const CTimeSegment& segment : segments) {
        svg.Rect(places.mLeft + segment.mLeft + kGapOfChords,
                 places.mTops[segment.mLine] + box.mTop, WidthInside(segment), kChordHeight,
                 box.mColor, box.mSymbol);
    }
    if (segments.empty()) return;
    const CTimeSegment& first = segments.front();
    const double x = places.mLeft + first.mLeft + kPaddingOfChords;
    const double room = first.Width() - kPaddingOfChords - kGapOfChords;
    const double top = places.mTops[first.mLine] + box.mTop;
    svg.TextCut(x, top + 22, room, box.mSymbol,
                {.mSize = kSymbolSize, .mColor = kInk, .mBold = true});
    svg.TextCut(x, top + kCaptionBelowChord + box.mCaptionFont.mSize, room, box.mCaption,
                box.mCaptionFont);
}

double WidthOfChord(std::string_view symbol, std::string_view caption, double captionSize) {
    const double widest = std::max(TextWidth(symbol, kSymbolSize), TextWidth(caption, captionSize));
    return std::max(kNarrowestChord, widest + 2 * kPaddingOfChords);
}

std::string DescriptionOf(std::string_view picture, const CShownKeys& keys) {
    constexpr std::size_t kMostCharacters = 600;
    std::string text(picture);
    // Without the full stop at their end.
    for (const std::string& note : keys.mNotes) text += ". " + note.substr(0, note.size() - 1);
    for (const CShownKeyRegion& region : keys.mRegions) {
        text += fmt::format(". {}:", region.mName);
        for (const CShownNumeral& chord : region.mChords) {
            text += " " + FirstCharacters(chord.mSymbol, 24);
            if (text.size() > kMostCharacters) return Printable(text + " \xE2\x80\xA6");
        }
    }
    return Printable(text);
}

}  // namespace brindle
