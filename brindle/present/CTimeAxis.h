// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/ShownSong.h"

#include <cstddef>
#include <vector>

namespace brindle {

/// A piece of a range that lies on one line of a picture, in pixels from the left of the line.
struct CTimeSegment {
    std::size_t mLine = 0;  ///< from 0
    double mLeft = 0.0;     ///< where it begins
    double mRight = 0.0;    ///< where it ends

    [[nodiscard]] double Width() const { return mRight - mLeft; }  ///< in pixels
};

/// A bar line, and the number of the bar that begins there.
struct CBarLine {
    double mX = 0.0;  ///< in pixels from the left of the line
    long mBar = 0;    ///< as CBars counts
};

/// How the time of a song breaks into lines as text does, at bar lines where a bar fits into a
/// line.
class CTimeAxis {
public:
    /// Makes room for the widest chord in the time of the shortest, but never more lines than there
    /// are chords.
    CTimeAxis(const CShownSong& song, double lineWidth, double widestChord);

    [[nodiscard]] std::size_t LineCount() const { return mLineCount; }  ///< at least 1
    /// The pieces of a range from the first line to the last.
    [[nodiscard]] std::vector<CTimeSegment> SegmentsOf(const CTimeRange& range) const;
    /// The whole of a line that belongs to the song.
    [[nodiscard]] CTimeSegment Line(std::size_t line) const;
    /// The bar lines of a line; where bars are narrow only every second, fourth, ... one.
    [[nodiscard]] std::vector<CBarLine> BarLines(std::size_t line) const;

private:
    [[nodiscard]] double StartOf(std::size_t line) const;
    [[nodiscard]] std::vector<CBarLine> EqualBarLines(std::size_t line) const;

    double mEnd;
    double mBeatsPerBar;
    double mLineWidth;
    double mBeatsPerLine;
    std::vector<double> mBarStarts;   // empty where all bars are equal
    std::vector<double> mLineStarts;  // likewise
    std::size_t mLineCount;
};

}  // namespace brindle
