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
        longest = std::max(longest, CountCharacters(DotText(grid, i, dots)));
    }
    return longest + 1;
}

/// A line by its characters, since signs take several bytes each.
class CCharacterRow {
public:
    explicit CCharacterRow(std::size_t width) : mCharacters(width, " ") {}

    void Write(std::size_t at, std::string_view text) {
        for (; at < mCharacters.size() && !text.empty(); ++at) {
            mCharacters[at] = FirstCharacters(text, 1);
            text.remove_prefix(mCharacters[at].size());
        }
    }

    /// Without the blanks behind it.
    [[nodiscard]] std::string Text() const {
        std::string text = fmt::format("{}", fmt::join(mCharacters, ""));
        text.erase(text.find_last_not_of(' ') + 1);
        return text;
    }

private:
    std::vector<std::string> mCharacters;
};

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
        CCharacterRow marks(mGap * mStrings);
        for (std::size_t i = 0; i < mStrings; ++i) {
            const int fret = mGrid.mFrets[i];
            const std::string said = fret == 0 ? DotText(mGrid, i, mStyle.mDots) : std::string();
            if (fret <= 0) marks.Write(At(i), fret < 0 ? "x" : said.empty() ? "o" : said);
        }
        return marks.Text();
    }

    [[nodiscard]] std::string Fret(int fret) const {
        CCharacterRow row(mGap * mStrings);
        for (std::size_t i = 0; i < mStrings; ++i) row.Write(At(i), "|");
        for (const GChChordElem& elem : mGrid.mElems) {
            if (elem.absFretIndex() == fret) Draw(elem, row);
        }
        return row.Text();
    }

private:
    [[nodiscard]] std::size_t At(std::size_t string) const {
        return mGap * (mStyle.mLeftHanded ? mStrings - 1 - string : string);
    }

    void Draw(const GChChordElem& elem, CCharacterRow& row) const {
        const auto first = static_cast<std::size_t>(elem.coveredMinStr());
        const auto last = std::min(static_cast<std::size_t>(elem.coveredMaxStr()), mStrings - 1);
        if (first >= mStrings) return;
        const std::size_t left = std::min(At(first), At(last));
        const std::size_t right = std::max(At(first), At(last));
        row.Write(left, std::string(right - left + 1, '-'));
        for (const std::size_t end : {left, right}) row.Write(end, std::string(1, MarkOf(elem)));
        for (std::size_t i = first; i <= last; ++i) {
            const std::string said = DotText(mGrid, i, mStyle.mDots);
            if (mGrid.mFrets[i] == elem.absFretIndex() + 1) row.Write(At(i), said);
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
    if (!grid.mSounds.empty()) head.push_back("sounds " + grid.mSounds);
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
