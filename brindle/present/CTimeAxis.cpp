// SPDX-License-Identifier: MIT
#include "brindle/present/CTimeAxis.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

constexpr double kNarrowestBar = 22.0;

struct CChordTimes {
    double mShortest;
    std::size_t mCount = 0;
};

CChordTimes ChordTimes(const CShownSong& song) {
    CChordTimes times{song.mEnd};
    ForEachChord(song, [&](const CShownChord& chord) {
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

double BeatsPerLine(const CShownSong& song, double lineWidth, double widestChord) {
    const CChordTimes times = ChordTimes(song);
    const double chordsPerLine = std::max(1.0, std::floor(lineWidth / widestChord));
    const double readable = RoundedToBars(times.mShortest * chordsPerLine, song.mBeatsPerBar);
    const double few = song.mEnd / static_cast<double>(times.mCount + 1);
    const double beats = std::max(readable, few);
    return beats > 0.0 ? beats : song.mBeatsPerBar;
}

// Where lines begin when each takes as many whole bars as it has room for. A bar that is shorter
// than the others at the begin goes with the first line all the same.
std::vector<double> LineStarts(const std::vector<double>& barStarts, double end, double room,
                               double upbeat) {
    std::vector<double> starts{0.0};
    double until = room + upbeat;
    for (std::size_t bar = 1; bar < barStarts.size() && barStarts[bar] < end; ++bar) {
        const double barEnd = bar + 1 < barStarts.size() ? barStarts[bar + 1] : end;
        const double rounding = 1e-9 * room;
        if (std::min(barEnd, end) <= until + rounding || barStarts[bar] <= starts.back()) continue;
        starts.push_back(barStarts[bar]);
        until = barStarts[bar] + room;
    }
    return starts;
}

double UpbeatOf(const CShownSong& song) {
    if (song.mBarStarts.size() < 2) return 0.0;
    const double first = song.mBarStarts[1] - song.mBarStarts[0];
    return first < song.mBeatsPerBar ? first : 0.0;
}

double LongestLine(const std::vector<double>& starts, double end) {
    double longest = 0.0;
    for (std::size_t line = 0; line < starts.size(); ++line) {
        const double next = line + 1 < starts.size() ? starts[line + 1] : end;
        longest = std::max(longest, next - starts[line]);
    }
    return longest;
}

}  // namespace

CTimeAxis::CTimeAxis(const CShownSong& song, double lineWidth, double widestChord)
    : mEnd(song.mEnd),
      mBeatsPerBar(song.mBeatsPerBar),
      mLineWidth(lineWidth),
      mBeatsPerLine(BeatsPerLine(song, lineWidth, widestChord)),
      mBarStarts(song.mBarStarts),
      mLineCount(static_cast<std::size_t>(std::max(1.0, std::ceil(mEnd / mBeatsPerLine)))) {
    if (mBarStarts.empty()) return;
    mLineStarts = LineStarts(mBarStarts, mEnd, mBeatsPerLine, UpbeatOf(song));
    mLineCount = mLineStarts.size();
    mBeatsPerLine = std::max(LongestLine(mLineStarts, mEnd), mBeatsPerLine);
}

double CTimeAxis::StartOf(std::size_t line) const {
    if (mLineStarts.empty()) return static_cast<double>(line) * mBeatsPerLine;
    return line < mLineCount ? mLineStarts[line] : mEnd;
}

std::vector<CTimeSegment> CTimeAxis::SegmentsOf(const CTimeRange& range) const {
    std::vector<CTimeSegment> segments;
    const double begin = std::clamp(range.mBegin, 0.0, mEnd);
    const double end = std::clamp(range.mEnd, 0.0, mEnd);
    auto line = static_cast<std::size_t>(begin / mBeatsPerLine);
    if (!mLineStarts.empty()) {
        const auto behind = std::upper_bound(mLineStarts.begin(), mLineStarts.end(), begin);
        line = static_cast<std::size_t>(behind - mLineStarts.begin() - 1);
    }
    for (double from = begin; from < end && line < mLineCount; ++line) {
        const double start = StartOf(line);
        const double to =
            std::min(end, mLineStarts.empty() ? start + mBeatsPerLine : StartOf(line + 1));
        const double scale = mLineWidth / mBeatsPerLine;
        segments.push_back({line, (from - start) * scale, (to - start) * scale});
        from = to;
    }
    return segments;
}

CTimeSegment CTimeAxis::Line(std::size_t line) const {
    const double rest = (mLineStarts.empty() ? mEnd : StartOf(line + 1)) - StartOf(line);
    return {line, 0.0, std::clamp(rest / mBeatsPerLine, 0.0, 1.0) * mLineWidth};
}

std::vector<CBarLine> CTimeAxis::BarLines(std::size_t line) const {
    if (mBarStarts.empty()) return EqualBarLines(line);
    std::vector<CBarLine> lines;
    const double start = StartOf(line);
    const double scale = mLineWidth / mBeatsPerLine;
    const auto first = std::lower_bound(mBarStarts.begin(), mBarStarts.end(), start);
    const auto last = std::lower_bound(first, mBarStarts.end(), std::min(StartOf(line + 1), mEnd));
    for (auto bar = first; bar != last; ++bar) {
        const double x = (*bar - start) * scale;
        if (!lines.empty() && x - lines.back().mX < kNarrowestBar) continue;
        lines.push_back({x, bar - mBarStarts.begin() + 1});
    }
    return lines;
}

std::vector<CBarLine> CTimeAxis::EqualBarLines(std::size_t line) const {
    const double barWidth = mBeatsPerBar * mLineWidth / mBeatsPerLine;
    double step = 1.0;
    while (step * barWidth < kNarrowestBar) step *= 2.0;

    std::vector<CBarLine> lines;
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

}  // namespace brindle
