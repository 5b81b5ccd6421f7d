// SPDX-License-Identifier: MIT
#include "brindle/present/GridsText.h"

#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstddef>

namespace brindle {
namespace {

constexpr std::size_t kWidestGridLine = 80;
constexpr std::size_t kGapOfGrids = 4;

/// The lines of one diagram; the first is its name.
using TBlock = std::vector<std::string>;

char MarkOf(const GChChordElem& elem) {
    if (!elem.isReal()) return '+';
    return elem.fingerNumber() == 0 ? '*' : static_cast<char>('0' + elem.fingerNumber());
}

/// From a string to the next one, with room for what stands on them.
std::size_t GapOfStrings(const CChordGrid& grid, TGridDots dots) {
    if (dots == TGridDots::Fingers) return 2;
    std::size_t longest = 2;
    for (std::size_t i = 0; i < grid.mFrets.size(); ++i) {
        longest = std::max(longest, DotText(grid, i, dots).size());
    }
    return longest + 1;
}

/// Draws the frets of one diagram. The lowest string stands on the left, or on the right for the
/// left hand; strings stand as far apart as what is written on them asks for.
class CTextGrid {
public:
    CTextGrid(const CChordGrid& grid, const CGridStyle& style)
        : mGrid(grid),
          mStyle(style),
          mStrings(grid.mFrets.size()),
          mGap(GapOfStrings(grid, style.mDots)) {}

    [[nodiscard]] std::size_t Width() const { return mGap * (mStrings - 1) + 1; }

    [[nodiscard]] std::string StringMarks() const {
        std::string marks(mGap * mStrings, ' ');
        for (std::size_t i = 0; i < mStrings; ++i) {
            const int fret = mGrid.mFrets[i];
            const std::string said = fret == 0 ? DotText(mGrid, i, mStyle.mDots) : std::string();
            if (fret <= 0) Write(marks, At(i), fret < 0 ? "x" : said.empty() ? "o" : said);
        }
        return marks;
    }

    [[nodiscard]] std::string Fret(int fret) const {
        std::string row(mGap * mStrings, ' ');
        for (std::size_t i = 0; i < mStrings; ++i) row[At(i)] = '|';
        for (const GChChordElem& elem : mGrid.mElems) {
            if (elem.absFretIndex() == fret) Draw(elem, row);
        }
        return row.substr(0, row.find_last_not_of(' ') + 1);
    }

private:
    [[nodiscard]] std::size_t At(std::size_t string) const {
        return mGap * (mStyle.mLeftHanded ? mStrings - 1 - string : string);
    }

    static void Write(std::string& row, std::size_t at, std::string_view text) {
        row.replace(at, text.size(), text);
    }

    void Draw(const GChChordElem& elem, std::string& row) const {
        const auto first = static_cast<std::size_t>(elem.coveredMinStr());
        const auto last = std::min(static_cast<std::size_t>(elem.coveredMaxStr()), mStrings - 1);
        if (first >= mStrings) return;
        const std::size_t left = std::min(At(first), At(last));
        const std::size_t right = std::max(At(first), At(last));
        for (std::size_t at = left; at <= right; ++at) row[at] = '-';
        row[left] = row[right] = MarkOf(elem);
        for (std::size_t i = first; i <= last; ++i) {
            const std::string said = DotText(mGrid, i, mStyle.mDots);
            if (mGrid.mFrets[i] == elem.absFretIndex() + 1) Write(row, At(i), said);
        }
    }

    const CChordGrid& mGrid;
    const CGridStyle& mStyle;
    std::size_t mStrings;
    std::size_t mGap;
};

std::string PitchesText(const CChordGrid& grid) {
    std::vector<std::string> names;
    for (std::size_t i = 0; i < grid.mPitches.size(); ++i) {
        if (grid.mPitches[i] >= 0) names.push_back(NoteText(grid, i));
    }
    return fmt::format("{}", fmt::join(names, " "));
}

/// Names, frets and pitches, and what is not as on every guitar.
TBlock HeadOf(const CChordGrid& grid) {
    TBlock head{NamesText(grid), FretsText(grid), PitchesText(grid)};
    const std::string tuning = TuningTitle(grid);
    if (!tuning.empty()) head.push_back(tuning);
    if (grid.mCapo > 0) head.push_back(fmt::format("capo {}", grid.mCapo));
    return head;
}

TBlock BlockOf(const CChordGrid& grid, const CGridStyle& style) {
    const CFretWindow window = WindowOf(grid);
    const CTextGrid drawing(grid, style);
    TBlock block = HeadOf(grid);
    block.push_back(drawing.StringMarks());
    block.emplace_back(drawing.Width(), window.mFirst == 0 ? '=' : '-');
    for (int fret = window.mFirst; fret < window.mFirst + window.mCount; ++fret) {
        std::string row = drawing.Fret(fret);
        if (fret == window.mFirst && fret > 0) row += fmt::format(" {}fr", fret + 1);
        block.push_back(row);
    }
    return block;
}

std::size_t WidthOfBlock(const TBlock& block) {
    std::size_t width = 0;
    for (const std::string& line : block) width = std::max(width, CountCharacters(line));
    return width;
}

/// Blocks with their tops on one line.
std::string Row(const std::vector<TBlock>& blocks, const CPaint& paint) {
    std::size_t height = 0;
    for (const TBlock& block : blocks) height = std::max(height, block.size());
    std::string text;
    for (std::size_t i = 0; i < height; ++i) {
        std::string line;
        for (const TBlock& block : blocks) {
            line += PadRight(i < block.size() ? block[i] : "", WidthOfBlock(block) + kGapOfGrids);
        }
        line.erase(line.find_last_not_of(' ') + 1);
        text += (i == 0 ? paint.Strong(line) : line) + '\n';
    }
    return text;
}

}  // namespace

std::string GridsText(const std::vector<CChordGrid>& grids, const CPaint& paint,
                      const CGridStyle& style) {
    std::string text;
    std::vector<TBlock> row;
    std::size_t width = 0;
    const auto endRow = [&] {
        if (row.empty()) return;
        text += (text.empty() ? "" : "\n") + Row(row, paint);
        row.clear();
        width = 0;
    };
    for (const CChordGrid& grid : grids) {
        TBlock block = BlockOf(grid, style);
        const std::size_t added = WidthOfBlock(block) + kGapOfGrids;
        if (width + added > kWidestGridLine + kGapOfGrids) endRow();
        width += added;
        row.push_back(std::move(block));
    }
    endRow();
    return text;
}

}  // namespace brindle
