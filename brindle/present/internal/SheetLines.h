// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/present/internal/Sheet.h"
#include "brindle/present/internal/SheetText.h"

#include <cstddef>
#include <vector>

/// Where the bars and chords of a lead sheet lie on their lines. Pixels, from the left end of a
/// line.
namespace brindle::LeadSheet {

inline constexpr double kSheetSymbolSize = 21.0;
inline constexpr double kNumeralSize = 13.0;

/// The texts of a chord; their widths are for full size.
struct CChordTexts {
    CTextRuns mSymbol;
    CTextRuns mNumeral;
    double mSymbolWidth = 0.0;
    double mNumeralWidth = 0.0;

    [[nodiscard]] double Width() const;
};

[[nodiscard]] std::vector<CChordTexts> MakeChordTexts(const CSong& song,
                                                      const CSongReading& reading);

struct CPlacedChord {
    std::size_t mChord = 0;
    double mX = 0.0;
    /// It has its place elsewhere and only sounds on here.
    bool mIsHeld = false;
};

/// A bar on a line. A bar with more chords than a line can hold goes on on the next ones.
struct CPlacedBar {
    std::size_t mBar = 0;
    bool mIsBegin = true;
    bool mIsEnd = true;
    double mX = 0.0;
    double mWidth = 0.0;
    std::vector<CPlacedChord> mChords;

    [[nodiscard]] double End() const { return mX + mWidth; }
};

struct CSheetLine {
    std::vector<CPlacedBar> mBars;

    [[nodiscard]] double Width() const { return mBars.empty() ? 0.0 : mBars.back().End(); }
};

struct CChordPlace {
    std::size_t mLine = kNone;
    double mX = 0.0;
};

struct CSheetLines {
    /// Of the symbols and numerals, the same on all lines; 1 or a little less.
    double mScale = 1.0;
    std::vector<CSheetLine> mLines;
    /// Of each chord of the song; without a line for a chord that is not drawn.
    std::vector<CChordPlace> mPlaces;
};

/// Breaks the bars into lines of that width with at most so many bars. A line ends before a
/// section and before a jump; where bars are too full, a line is halved, so that phrases stay at
/// their places. Chords lie in their bars as their beats do, and move aside where they would touch.
[[nodiscard]] CSheetLines BreakLines(const CSheet& sheet, const std::vector<CChordTexts>& texts,
                                     double width, std::size_t barsPerLine);

/// How far the chords of a bar are from its bar lines.
[[nodiscard]] double LeftPadding(const CSheetBar& bar);
[[nodiscard]] double RightPadding(const CSheetBar& bar);

/// Room for a time signature and for a repeat sign.
inline constexpr double kTimeWidth = 20.0;
inline constexpr double kRepeatWidth = 13.0;

}  // namespace brindle::LeadSheet
