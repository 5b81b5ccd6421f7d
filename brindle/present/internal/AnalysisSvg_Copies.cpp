// SPDX-License-Identifier: MIT
#include "brindle/present/internal/AnalysisSvg_Copies.h"

#include "brindle/present/CBars.h"

#include <map>

namespace brindle {
namespace {

/// Pale, so that a copy is not taken for a key, and far from the color of the source before it.
std::string ColorOfSource(std::size_t number) {
    constexpr std::size_t step = 137;  // the golden angle comes close to no hue again for long
    return HslColor(static_cast<int>(number * step % 360), 24, 88);
}

}  // namespace

void DrawCopies(CSvg& svg, const CTimeAxis& axis, const CLinePlaces& places, const CShownSong& song,
                double top, double height) {
    const CBars bars(song.mBeatsPerBar, song.mBarStarts);
    std::map<double, std::size_t> sources;  // by position, numbered as they are met
    for (const CShownCopy& copy : song.mCopies) {
        const auto source = sources.try_emplace(copy.mSource.mBegin, sources.size()).first;
        DrawBand(svg, axis, places, copy.mTarget,
                 {top,
                  height,
                  ColorOfSource(source->second),
                  "as " + BarsOf(copy.mSource, bars),
                  {.mSize = kSmallSize, .mColor = kFaintInk}});
    }
}

}  // namespace brindle
