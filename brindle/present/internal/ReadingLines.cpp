// SPDX-License-Identifier: MIT
#include "brindle/present/internal/ReadingLines.h"

#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"

#include <fmt/format.h>

#include <algorithm>
#include <map>
#include <utility>

namespace brindle {
namespace {

constexpr std::size_t kReadingBarsPerLine = 4;
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
    /// Bars that lines of this kind have at most: four, or two or one of lines that are too wide.
    std::size_t mMost = kReadingBarsPerLine;
    /// Of its bars, and of those that a longer line of this kind has.
    std::vector<std::size_t> mWidths = {};
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
        for (CReadingLine& line : FourBarsALine()) AddLine(std::move(line));
        Align();
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
                mKeys[region.mBegin] = KeyInWords(region.mKey);
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
            if (ix > bar.mBegin && IsSameAsBefore(ix)) continue;
            cells.push_back({mKeys[ix], std::move(symbol), mReading.mChords[ix].mNumeral});
        }
        return cells;
    }

    [[nodiscard]] bool IsSameAsBefore(std::size_t ix) const {
        const bool isNamedAlike =
            ix < mSong.mSymbols.size() && mSong.mSymbols[ix] == mSong.mSymbols[ix - 1];
        const auto& chords = mReading.mChords;
        return isNamedAlike && mKeys[ix].empty() && chords[ix].mNumeral == chords[ix - 1].mNumeral;
    }

    // A part begins at the bar in which its place is; several short ones share a bar.
    [[nodiscard]] bool BeginsPart(const CReadingBar& bar, std::size_t& section,
                                  std::string& name) const {
        bool begins = false;
        for (; section < mSong.mSections.size(); ++section) {
            const CSongSection& next = mSong.mSections[section];
            if (mBars.BarOf(next.mPosition) >= bar.mNumber + bar.mCount) break;
            begins = true;
            if (!name.empty() && !next.mName.empty()) name += ", ";
            name += Printable(next.mName);
        }
        return begins;
    }

    [[nodiscard]] bool IsUpbeat(std::size_t bar) const {
        const auto& bars = mSong.mBars;
        return bar == 0 && bars.size() > 1 && bars[0].mLength < bars[1].mLength;
    }

    [[nodiscard]] std::vector<CReadingLine> FourBarsALine() const {
        std::vector<CReadingLine> lines;
        std::size_t section = 0;
        for (std::size_t bar = 0; bar < mCells.size(); ++bar) {
            std::string name;
            const bool isPart = BeginsPart(mLines.mBars[bar], section, name);
            const bool isFull =
                bar == 0 || bar - lines.back().mBegin >= kReadingBarsPerLine || IsUpbeat(bar - 1);
            if (isPart || isFull) lines.push_back({bar, bar, std::move(name)});
            lines.back().mEnd = bar + 1;
        }
        return lines;
    }

    // In halves where it is too wide, so that a crowded bar narrows no other line.
    void AddLine(CReadingLine line) {
        for (std::size_t bar = line.mBegin; bar < line.mEnd; ++bar) {
            line.mWidths.push_back(WidthOfBar(mCells[bar]));
        }
        const bool fits = WidthOf(line.mWidths) <= mLines.mWidth;
        if (fits || line.mMost == 1) {
            mBroken.push_back(std::move(line));
            return;
        }
        const std::size_t most = line.mMost / 2;
        const std::size_t middle = std::min(line.mBegin + most, line.mEnd);
        AddLine({line.mBegin, middle, std::move(line.mName), most});
        if (middle < line.mEnd) AddLine({middle, line.mEnd, {}, most});
    }

    // Bars stand below each other where the lines of a kind have the room.
    void Align() {
        std::map<std::size_t, std::vector<std::size_t>> widest;
        for (const CReadingLine& line : mBroken) {
            std::vector<std::size_t>& widths = widest[line.mMost];
            widths.resize(line.mMost);
            for (std::size_t bar = 0; bar < line.mWidths.size(); ++bar) {
                widths[bar] = std::max(widths[bar], line.mWidths[bar]);
            }
        }
        for (CReadingLine& line : mBroken) {
            const std::vector<std::size_t>& widths = widest[line.mMost];
            if (WidthOf(widths) <= mLines.mWidth) line.mWidths = widths;
        }
    }

    [[nodiscard]] std::size_t WidthOf(const std::vector<std::size_t>& bars) const {
        constexpr std::size_t around = 3;
        std::size_t width = mLabelWidth + 2;
        for (const std::size_t bar : bars) width += bar + around;
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
        return PadRight(row, line.mWidths[bar - line.mBegin]);
    }

    const CSong& mSong;
    const CSongReading& mReading;
    const CReadingLines& mLines;
    const CPaint& mPaint;
    CBars mBars;
    std::vector<std::string> mKeys;
    std::vector<TBarCells> mCells;
    std::vector<CReadingLine> mBroken;
    std::size_t mLabelWidth = 1;
};

}  // namespace

std::string ReadingLines(const CSong& song, const CSongReading& reading, const CReadingLines& lines,
                         const CPaint& paint) {
    return CLineWriter(song, reading, lines, paint).Write();
}

}  // namespace brindle
