// SPDX-License-Identifier: MIT
#include "cli/AnalysisSvg_Copies.h"

#include "cli/Bars.h"

#include <map>

namespace brindle::cli {
namespace {

/// Pale, so that a copy is not taken for a key, and far from the color of the source before it.
std::string ColorOfSource(std::size_t number) {
    constexpr std::size_t step = 137;  // the golden angle comes close to no hue again for long
    return HslColor(static_cast<int>(number * step % 360), 24, 88);
}

}  // namespace

void DrawCopies(CSvg& svg, const CTimeAxis& axis, const TLinePlaces& places, const TSong& song,
                double top, double height) {
    const CBars bars(song.mBeatsPerBar, song.mBarStarts);
    std::map<double, std::size_t> sources;  // by position, numbered as they are met
    for (const TShownCopy& copy : song.mCopies) {
        const auto source = sources.try_emplace(copy.mSource.mBegin, sources.size()).first;
        DrawBand(svg, axis, places, copy.mTarget,
                 {top,
                  height,
                  ColorOfSource(source->second),
                  "as " + BarsOf(copy.mSource, bars),
                  {.mSize = kSmallSize, .mColor = kFaintInk}});
    }
}

}  // namespace brindle::cli
