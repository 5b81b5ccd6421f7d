// SPDX-License-Identifier: MIT
#include "cli/TimeAxis.h"

#include <algorithm>
#include <cmath>

namespace brindle::cli {
namespace {

constexpr double kNarrowestBar = 22.0;

struct TChordTimes {
    double mShortest;
    std::size_t mCount = 0;
};

TChordTimes ChordTimes(const TSong& song) {
    TChordTimes times{song.mEnd};
    ForEachChord(song, [&](const TShownChord& chord) {
        const double length = chord.mRange.mEnd - chord.mRange.mBegin;
        if (length > 0.0) times.mShortest = std::min(times.mShortest, length);
        ++times.mCount;
    });
    return times;
}

// Whole bars, and of these a multiple of four where so many fit.
double RoundedToBars(double beats, double beatsPerBar) {
    const double bars = std::floor(beats / beatsPerBar);
    if (bars >= 4.0) return std::floor(bars / 4.0) * 4.0 * beatsPerBar;
    return bars >= 1.0 ? bars * beatsPerBar : beats;
}

double BeatsPerLine(const TSong& song, double lineWidth, double widestChord) {
    const TChordTimes times = ChordTimes(song);
    const double chordsPerLine = std::max(1.0, std::floor(lineWidth / widestChord));
    const double readable = RoundedToBars(times.mShortest * chordsPerLine, song.mBeatsPerBar);
    const double few = song.mEnd / static_cast<double>(times.mCount + 1);
    const double beats = std::max(readable, few);
    return beats > 0.0 ? beats : song.mBeatsPerBar;
}

}  // namespace

CTimeAxis::CTimeAxis(const TSong& song, double lineWidth, double widestChord)
    : mEnd(song.mEnd),
      mBeatsPerBar(song.mBeatsPerBar),
      mLineWidth(lineWidth),
      mBeatsPerLine(BeatsPerLine(song, lineWidth, widestChord)),
      mLineCount(static_cast<std::size_t>(std::max(1.0, std::ceil(mEnd / mBeatsPerLine)))) {}

std::vector<TSegment> CTimeAxis::SegmentsOf(const TRange& range) const {
    std::vector<TSegment> segments;
    const double begin = std::clamp(range.mBegin, 0.0, mEnd);
    const double end = std::clamp(range.mEnd, 0.0, mEnd);
    auto line = static_cast<std::size_t>(begin / mBeatsPerLine);
    for (double from = begin; from < end && line < mLineCount; ++line) {
        const double start = static_cast<double>(line) * mBeatsPerLine;
        const double to = std::min(end, start + mBeatsPerLine);
        const double scale = mLineWidth / mBeatsPerLine;
        segments.push_back({line, (from - start) * scale, (to - start) * scale});
        from = to;
    }
    return segments;
}

TSegment CTimeAxis::Line(std::size_t line) const {
    const double rest = mEnd - static_cast<double>(line) * mBeatsPerLine;
    return {line, 0.0, std::clamp(rest / mBeatsPerLine, 0.0, 1.0) * mLineWidth};
}

std::vector<TBarLine> CTimeAxis::BarLines(std::size_t line) const {
    const double barWidth = mBeatsPerBar * mLineWidth / mBeatsPerLine;
    double step = 1.0;
    while (step * barWidth < kNarrowestBar) step *= 2.0;

    std::vector<TBarLine> lines;
    const double start = static_cast<double>(line) * mBeatsPerLine;
    // A hair to the left, so that rounding does not lose the bar that begins with the line.
    double bar = std::ceil((start / mBeatsPerBar - 1e-6) / step) * step;
    for (;; bar += step) {
        const double x = (bar * mBeatsPerBar - start) * mLineWidth / mBeatsPerLine;
        // The bar line at the right end is drawn at the begin of the next line.
        if (!(x < Line(line).mRight - 1.0)) return lines;
        lines.push_back({std::max(0.0, x), std::lround(bar) + 1});
    }
}

}  // namespace brindle::cli
