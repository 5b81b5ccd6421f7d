// SPDX-License-Identifier: MIT
#include "brindle/present/GridsText.h"

#include "brindle/guitarchords/GChPitches.h"
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

/// Strings stand two characters apart.
void Draw(const GChChordElem& elem, std::size_t strings, std::string& row) {
    const auto first = static_cast<std::size_t>(elem.coveredMinStr());
    const auto last = std::min(static_cast<std::size_t>(elem.coveredMaxStr()), strings - 1);
    if (first >= strings) return;
    for (std::size_t at = 2 * first; at <= 2 * last; ++at) row[at] = '-';
    row[2 * first] = MarkOf(elem);
    row[2 * last] = MarkOf(elem);
}

std::string StringMarks(const CChordGrid& grid) {
    std::string marks;
    for (const int fret : grid.mFrets) {
        marks += fret < 0 ? 'x' : fret == 0 ? 'o' : ' ';
        marks += ' ';
    }
    return marks;
}

std::string PitchesText(const CChordGrid& grid) {
    std::vector<std::string> names;
    for (const int pitch : grid.mPitches) {
        if (pitch >= 0) names.push_back(GChMidiPitchDefaultName(pitch));
    }
    return fmt::format("{}", fmt::join(names, " "));
}

TBlock BlockOf(const CChordGrid& grid) {
    const std::size_t strings = grid.mFrets.size();
    const CFretWindow window = WindowOf(grid);
    TBlock block{NamesText(grid), FretsText(grid), PitchesText(grid)};
    if (grid.mCapo > 0) block.push_back(fmt::format("capo {}", grid.mCapo));
    block.push_back(StringMarks(grid));
    block.emplace_back(2 * strings - 1, window.mFirst == 0 ? '=' : '-');
    for (int fret = window.mFirst; fret < window.mFirst + window.mCount; ++fret) {
        std::string row;
        for (std::size_t i = 0; i < strings; ++i) row += i == 0 ? "|" : " |";
        for (const GChChordElem& elem : grid.mElems) {
            if (elem.absFretIndex() == fret) Draw(elem, strings, row);
        }
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

std::string GridsText(const std::vector<CChordGrid>& grids, const CPaint& paint) {
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
        TBlock block = BlockOf(grid);
        const std::size_t added = WidthOfBlock(block) + kGapOfGrids;
        if (width + added > kWidestGridLine + kGapOfGrids) endRow();
        width += added;
        row.push_back(std::move(block));
    }
    endRow();
    return text;
}

}  // namespace brindle
