// SPDX-License-Identifier: MIT
#include "cli/AnalysisSvg_Copies.h"

#include "cli/Bars.h"

#include <algorithm>
#include <map>

namespace brindle::cli {
namespace {

constexpr double kGap = 1.0;
constexpr double kPadding = 5.0;
constexpr TSvgFont kFont{.mSize = 10.0, .mColor = "#444444"};

/// Pale, so that a copy is not taken for a key, and far from the color of the source before it.
std::string ColorOfSource(std::size_t number) {
    constexpr std::size_t step = 137;  // the golden angle never comes back to a hue
    return HslColor(static_cast<int>(number * step % 360), 24, 88);
}

void Draw(CSvg& svg, const CTimeAxis& axis, const TCopiesBand& band, const TRange& range,
          const std::string& color, const std::string& label) {
    for (const TSegment& segment : axis.SegmentsOf(range)) {
        const double x = band.mLeft + segment.mLeft + kGap;
        const double y = band.mLineTops[segment.mLine] + band.mTop;
        svg.Rect(x, y, std::max(0.5, segment.Width() - 2 * kGap), band.mHeight, color, label);
        svg.TextCut(x + kPadding, y + band.mHeight / 2 + kFont.mSize * 0.36,
                    segment.Width() - kPadding, label, kFont);
    }
}

}  // namespace

void DrawCopies(CSvg& svg, const CTimeAxis& axis, const TCopiesBand& band, const TSong& song) {
    const CBars bars(song.mBeatsPerBar, song.mBarStarts);
    std::map<double, std::size_t> sources;  // by position, numbered as they are met
    for (const TShownCopy& copy : song.mCopies) {
        const auto source = sources.try_emplace(copy.mSource.mBegin, sources.size()).first;
        Draw(svg, axis, band, copy.mTarget, ColorOfSource(source->second),
             "as " + BarsOf(copy.mSource, bars));
    }
}

}  // namespace brindle::cli
