// SPDX-License-Identifier: MIT
#include "brindle/present/GridsSvg.h"

#include "brindle/present/ShownText.h"
#include "brindle/present/SongShapes.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstddef>
#include <sstream>

namespace brindle {
namespace {

constexpr double kMarginOfGrids = 16.0;
constexpr std::size_t kGridsPerLine = 6;

// A full diagram, from its top left corner.
constexpr double kNameSize = 15.0;
constexpr double kSizeOfLabels = 10.0;
constexpr double kDotTextSize = 8.0;    // of two letters on a dot
constexpr double kSmallestOnDot = 5.5;  // "Sol" with its sign just fits
constexpr double kSizeOfThreeOnDot = 6.4;
constexpr double kHeadSize = 12.0;
constexpr double kLinesOfHead = 1.5;  // from line to line, in sizes
constexpr double kNarrowestHead = 480.0;
constexpr double kLabelRoom = 26.0;  // left of the strings, for the number of the first fret

constexpr std::string_view kWire = "#999999";
constexpr std::string_view kPaper = "#ffffff";

/// Draws one diagram.
class CGridPicture {
public:
    CGridPicture(CSvg& svg, const CChordGrid& grid, double left, double top, double scale,
                 const CGridStyle& style)
        : mSvg(svg),
          mGrid(grid),
          mStyle(style),
          mWindow(WindowOf(grid)),
          mStringGap(kGridStringGap * scale),
          mFretGap(kGridFretGap * scale),
          mLeft(left),
          mTop(top) {}

    void Draw() {
        DrawWires();
        for (std::size_t i = 0; i < mGrid.mFrets.size(); ++i) {
            if (mGrid.mFrets[i] <= 0) DrawStringMark(i, mGrid.mFrets[i] < 0);
        }
        for (const GChChordElem& elem : mGrid.mElems) DrawElem(elem);
    }

private:
    [[nodiscard]] double StringX(std::size_t string) const {
        const std::size_t place = mStyle.mLeftHanded ? mGrid.mFrets.size() - 1 - string : string;
        return mLeft + mStringGap * static_cast<double>(place);
    }
    [[nodiscard]] double FretY(double fret) const { return mTop + mFretGap * fret; }
    [[nodiscard]] double DotRadius() const { return mStringGap * 0.42; }

    void DrawWires() {
        const double right = mLeft + mStringGap * static_cast<double>(mGrid.mFrets.size() - 1);
        const double bottom = FretY(mWindow.mCount);
        for (std::size_t i = 0; i < mGrid.mFrets.size(); ++i) {
            mSvg.Line(StringX(i), mTop, StringX(i), bottom, kWire);
        }
        for (int fret = 0; fret <= mWindow.mCount; ++fret) {
            mSvg.Line(mLeft, FretY(fret), right, FretY(fret), kWire);
        }
        if (mWindow.mFirst == 0) {
            mSvg.Rect(mLeft - 1, mTop - 4, right - mLeft + 2, 4, kInk);
        } else {
            mSvg.Text(mLeft - mStringGap * 0.8, FretY(0.5) + kSizeOfLabels * 0.36,
                      fmt::format("{}", mWindow.mFirst + 1),
                      {.mSize = kSizeOfLabels, .mColor = kFaintInk, .mAnchor = "end"});
        }
    }

    // A cross for a muted string, a ring for an open one, or what it says.
    void DrawStringMark(std::size_t string, bool isMuted) {
        const double x = StringX(string);
        const double y = mTop - mStringGap * 0.7;
        const double r = mStringGap * 0.24;
        if (isMuted) {
            mSvg.Line(x - r, y - r, x + r, y + r, kInk);
            mSvg.Line(x - r, y + r, x + r, y - r, kInk);
        } else if (SaysMore()) {
            mSvg.Text(x, y + r, DotText(mGrid, string, mStyle.mDots),
                      {.mSize = kSizeOfLabels, .mColor = kInk, .mAnchor = "middle"});
        } else {
            mSvg.Circle(x, y, r, kPaper, kInk);
        }
    }

    /// Notes or degrees stand on the dots.
    [[nodiscard]] bool SaysMore() const {
        return mStyle.mDots != TGridDots::Fingers && mStringGap >= kGridStringGap;
    }

    void DrawElem(const GChChordElem& elem) {
        const std::size_t strings = mGrid.mFrets.size();
        const auto first = static_cast<std::size_t>(elem.coveredMinStr());
        const auto last = std::min(static_cast<std::size_t>(elem.coveredMaxStr()), strings - 1);
        if (first >= strings) return;
        const double y = FretY(elem.absFretIndex() - mWindow.mFirst + 0.5);
        const double r = DotRadius();
        if (last > first) {
            const double left = std::min(StringX(first), StringX(last));
            const double right = std::max(StringX(first), StringX(last));
            mSvg.Rect(left, y - r * 0.8, right - left, r * 1.6, kInk);
        }
        for (const std::size_t string : {first, last}) {
            mSvg.Circle(StringX(string), y, r, elem.isReal() ? kInk : kPaper, kInk);
        }
        if (SaysMore()) {
            for (std::size_t i = first; i <= last; ++i) {
                const bool sounds = mGrid.mFrets[i] == elem.absFretIndex() + 1;
                if (sounds) SayTone(elem, i, y);
            }
        } else if (elem.fingerNumber() > 0 && mStringGap >= kGridStringGap) {
            Say(elem, first, y, fmt::format("{}", elem.fingerNumber()), kSizeOfLabels);
        }
    }

    void SayTone(const GChChordElem& elem, std::size_t string, double y) {
        const std::string text = DotText(mGrid, string, mStyle.mDots);
        const std::size_t letters = CountCharacters(text);
        Say(elem, string, y, text,
            letters <= 2   ? kDotTextSize
            : letters == 3 ? kSizeOfThreeOnDot
                           : kSmallestOnDot);
    }

    void Say(const GChChordElem& elem, std::size_t string, double y, std::string_view text,
             double size) {
        mSvg.Text(StringX(string), y + size * 0.36, text,
                  {.mSize = size,
                   .mColor = elem.isReal() ? kPaper : kInk,
                   .mBold = true,
                   .mAnchor = "middle"});
    }

    CSvg& mSvg;
    const CChordGrid& mGrid;
    CGridStyle mStyle;
    CFretWindow mWindow;
    double mStringGap;
    double mFretGap;
    double mLeft;
    double mTop;
};

/// Frets, capodaster, and a tuning that is not the usual one.
std::string SmallText(const CChordGrid& grid) {
    std::string text = FretsText(grid);
    if (grid.mCapo > 0) text += fmt::format(", capo {}", grid.mCapo);
    if (!grid.mSounds.empty()) text += ", sounds " + grid.mSounds;
    const std::string tuning = TuningTitle(grid);
    return tuning.empty() ? text : text + ", " + tuning;
}

/// The room of one diagram on a sheet: that of the largest.
struct CGridPlace {
    double mWidth = 0.0;
    double mHeight = 0.0;
};

CGridPlace CellFor(const std::vector<CChordGrid>& grids) {
    CGridPlace cell;
    for (const CChordGrid& grid : grids) {
        const double neck = kGridStringGap * static_cast<double>(grid.mFrets.size() - 1);
        const double name = TextWidth(NamesText(grid), kNameSize);
        const double small = TextWidth(SmallText(grid), kSizeOfLabels);
        cell.mWidth = std::max(cell.mWidth, kLabelRoom + std::max({neck, name, small}));
        cell.mHeight = std::max(cell.mHeight, kGridFretGap * WindowOf(grid).mCount);
    }
    return {cell.mWidth + 24.0, cell.mHeight + 72.0};
}

/// A text in lines of at most that width; a longer word has a line of its own.
std::vector<std::string> BrokenLines(const std::string& text, double width, double size) {
    std::vector<std::string> lines(1);
    std::istringstream words(text);
    for (std::string word; words >> word;) {
        std::string& line = lines.back();
        const std::string longer = line.empty() ? word : line + ' ' + word;
        if (line.empty() || TextWidth(longer, size) <= width) {
            line = longer;
        } else {
            lines.push_back(word);
        }
    }
    return lines;
}

/// Draws what stands above the diagrams, its first text in bold, and gives where these begin.
double DrawLinesAbove(CSvg& svg, const std::vector<std::string>& head, double width) {
    double y = kMarginOfGrids;
    for (std::size_t i = 0; i < head.size(); ++i) {
        const std::string_view color = i == 0 ? kInk : kFaintInk;
        for (const std::string& line : BrokenLines(head[i], width, kHeadSize)) {
            svg.Text(kMarginOfGrids, y + kHeadSize, line,
                     {.mSize = kHeadSize, .mColor = color, .mBold = i == 0});
            y += kHeadSize * kLinesOfHead;
        }
    }
    return head.empty() ? y : y + kHeadSize;
}

}  // namespace

void DrawGrid(CSvg& svg, const CChordGrid& grid, double left, double top, double scale,
              const CGridStyle& style) {
    CGridPicture(svg, grid, left, top, scale, style).Draw();
}

std::string GridsSvg(const std::vector<CChordGrid>& grids, std::string_view title,
                     const CGridStyle& style, const std::vector<std::string>& head) {
    const CGridPlace cell = CellFor(grids);
    const std::size_t count = std::max<std::size_t>(grids.size(), 1);
    const double columns = static_cast<double>(std::min(count, kGridsPerLine));
    const double rows = static_cast<double>((count + kGridsPerLine - 1) / kGridsPerLine);
    const double width = std::max(cell.mWidth * columns, head.empty() ? 0.0 : kNarrowestHead);
    CSvg svg;
    const double begin = DrawLinesAbove(svg, head, width);
    for (std::size_t i = 0; i < grids.size(); ++i) {
        const double left = kMarginOfGrids + cell.mWidth * static_cast<double>(i % kGridsPerLine);
        const double top = begin + cell.mHeight * static_cast<double>(i / kGridsPerLine);
        const double neck = left + kLabelRoom;
        svg.Text(neck, top + kNameSize, NamesText(grids[i]),
                 {.mSize = kNameSize, .mColor = kInk, .mBold = true});
        svg.Text(neck, top + kNameSize + 14, SmallText(grids[i]),
                 {.mSize = kSizeOfLabels, .mColor = kFaintInk});
        DrawGrid(svg, grids[i], neck, top + kNameSize + 36, 1.0, style);
    }
    return svg.File(width + 2 * kMarginOfGrids, begin + cell.mHeight * rows + kMarginOfGrids,
                    title);
}

}  // namespace brindle
