// SPDX-License-Identifier: MIT
#include "brindle/present/internal/ReadingLines.h"

#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>

namespace brindle {
namespace {

constexpr std::array<std::size_t, 3> kBarsPerLineTried{4, 2, 1};
constexpr std::string_view kGapOfBars = "  ";
/// A chord that was there before, as people type it.
constexpr std::string_view kChordHeld = ".";

/// A chord with what stands over and under it.
struct CReadingCell {
    std::string mKey;
    std::string mSymbol;
    std::string mNumeral;

    [[nodiscard]] std::size_t Width() const {
        return std::max(
            {CountCharacters(mKey), CountCharacters(mSymbol), CountCharacters(mNumeral)});
    }
};
using TBarCells = std::vector<CReadingCell>;

std::size_t WidthOfBar(const TBarCells& bar) {
    std::size_t width = bar.empty() ? 0 : kGapOfBars.size() * (bar.size() - 1);
    for (const CReadingCell& cell : bar) width += cell.Width();
    return width;
}

/// The bars [mBegin, mEnd) that stand on one line, and the name of the part that begins there.
struct CReadingLine {
    std::size_t mBegin = 0;
    std::size_t mEnd = 0;
    std::string mName;
};

class CLineWriter {
public:
    CLineWriter(const CSong& song, const CSongReading& reading, const CReadingLines& lines,
                const CPaint& paint)
        : mSong(song), mReading(reading), mLines(lines), mPaint(paint), mBars(BarsOfSong(song)) {
        NameKeys();
        mCells.reserve(lines.mBars.size());
        for (const CReadingBar& bar : lines.mBars) mCells.push_back(CellsOf(bar));
        if (!lines.mBars.empty()) {
            mLabelWidth = fmt::format("{}", lines.mBars.back().mNumber).size();
        }
    }

    [[nodiscard]] std::string Write() {
        for (const std::size_t barsPerLine : kBarsPerLineTried) {
            Break(barsPerLine);
            if (LineWidth() <= mLines.mWidth) break;
        }
        std::string text;
        for (const CReadingLine& line : mBroken) WriteLine(line, text);
        return text;
    }

private:
    // The key of a song that has only one is told above.
    void NameKeys() {
        mKeys.resize(mReading.mChords.size());
        const auto& regions = mReading.mRegions;
        if (regions.size() == 1 && regions.front().mKey == mReading.mKey) return;
        for (const CKeyRegion& region : regions) {
            if (region.mBegin < mKeys.size()) {
                mKeys[region.mBegin] = region.mKey.NameLong(NamePrefs());
            }
        }
    }

    [[nodiscard]] TBarCells CellsOf(const CReadingBar& bar) const {
        TBarCells cells;
        if (!bar.HasChords()) {
            cells.push_back({"", std::string(kChordHeld), ""});
            if (bar.mCount > 1) cells.front().mSymbol += fmt::format(" x {}", bar.mCount);
            return cells;
        }
        const double begin = mSong.mChords[bar.mBegin].mPosition;
        if (mBars.BeatOf(begin) > 1.0) cells.push_back({"", std::string(kChordHeld), ""});
        for (std::size_t ix = bar.mBegin; ix < bar.mEnd; ++ix) {
            std::string symbol = ix < mSong.mSymbols.size() ? Printable(mSong.mSymbols[ix]) : "";
            if (symbol.empty()) symbol = "-";
            cells.push_back({mKeys[ix], std::move(symbol), mReading.mChords[ix].mNumeral});
        }
        return cells;
    }

    // A part begins at the bar in which its place is.
    [[nodiscard]] bool BeginsPart(const CReadingBar& bar, std::size_t& section,
                                  std::string& name) const {
        bool begins = false;
        for (; section < mSong.mSections.size(); ++section) {
            const CSongSection& next = mSong.mSections[section];
            if (mBars.BarOf(next.mPosition) >= bar.mNumber + bar.mCount) break;
            begins = true;
            name = Printable(next.mName);
        }
        return begins;
    }

    [[nodiscard]] bool IsUpbeat(std::size_t bar) const {
        const auto& bars = mSong.mBars;
        return bar == 0 && bars.size() > 1 && bars[0].mLength < bars[1].mLength;
    }

    void Break(std::size_t barsPerLine) {
        mBroken.clear();
        std::size_t section = 0;
        for (std::size_t bar = 0; bar < mCells.size(); ++bar) {
            std::string name;
            const bool isPart = BeginsPart(mLines.mBars[bar], section, name);
            const bool isFull =
                bar == 0 || bar - mBroken.back().mBegin >= barsPerLine || IsUpbeat(bar - 1);
            if (isPart || isFull) mBroken.push_back({bar, bar, std::move(name)});
            mBroken.back().mEnd = bar + 1;
        }
        mWidths.assign(barsPerLine, 0);
        for (const CReadingLine& line : mBroken) {
            for (std::size_t bar = line.mBegin; bar < line.mEnd; ++bar) {
                std::size_t& width = mWidths[bar - line.mBegin];
                width = std::max(width, WidthOfBar(mCells[bar]));
            }
        }
    }

    [[nodiscard]] std::size_t LineWidth() const {
        constexpr std::size_t around = 3;
        std::size_t width = mLabelWidth + 2;
        for (const std::size_t bar : mWidths) width += bar + around;
        return width;
    }

    void WriteLine(const CReadingLine& line, std::string& text) const {
        if (line.mBegin > 0) text += '\n';
        if (!line.mName.empty()) text += mPaint.Strong(line.mName) + '\n';
        WriteKeys(line, text);
        const std::string label =
            PadLeft(fmt::format("{}", mLines.mBars[line.mBegin].mNumber), mLabelWidth);
        text += mPaint.Faint(label + " |");
        for (std::size_t bar = line.mBegin; bar < line.mEnd; ++bar) {
            text +=
                ' ' + mPaint.Strong(Row(line, bar, &CReadingCell::mSymbol)) + mPaint.Faint(" |");
        }
        text += '\n' + mPaint.Faint(std::string(mLabelWidth, ' ') + " |");
        for (std::size_t bar = line.mBegin; bar < line.mEnd; ++bar) {
            text += ' ' + Row(line, bar, &CReadingCell::mNumeral) + mPaint.Faint(" |");
        }
        text += '\n';
    }

    void WriteKeys(const CReadingLine& line, std::string& text) const {
        std::string keys(mLabelWidth + 2, ' ');
        for (std::size_t bar = line.mBegin; bar < line.mEnd; ++bar) {
            keys += ' ' + Row(line, bar, &CReadingCell::mKey) + kGapOfBars.data();
        }
        const std::size_t last = keys.find_last_not_of(' ');
        if (last == keys.npos) return;
        text += mPaint.Accent(keys.substr(0, last + 1)) + '\n';
    }

    // One of the three texts of all chords of a bar.
    [[nodiscard]] std::string Row(const CReadingLine& line, std::size_t bar,
                                  std::string CReadingCell::*part) const {
        std::string row;
        for (const CReadingCell& cell : mCells[bar]) {
            if (!row.empty()) row += kGapOfBars;
            row += PadRight(cell.*part, cell.Width());
        }
        return PadRight(row, mWidths[bar - line.mBegin]);
    }

    const CSong& mSong;
    const CSongReading& mReading;
    const CReadingLines& mLines;
    const CPaint& mPaint;
    CBars mBars;
    std::vector<std::string> mKeys;
    std::vector<TBarCells> mCells;
    std::vector<CReadingLine> mBroken;
    std::vector<std::size_t> mWidths;
    std::size_t mLabelWidth = 1;
};

}  // namespace

std::string ReadingLines(const CSong& song, const CSongReading& reading, const CReadingLines& lines,
                         const CPaint& paint) {
    return CLineWriter(song, reading, lines, paint).Write();
}

}  // namespace brindle
