// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/ChordGrid.h"
#include "brindle/present/ShownSong.h"

#include <string>

namespace brindle {

/// An analysis as a picture: chords along a time axis, bands for sign keys, centers, keys, repeated
/// passages and readings. With `grids` (may be null) the fingering of each chord stands under it,
/// and under a capodaster what the hand plays.
[[nodiscard]] std::string AnalysisSvg(const CShownSong& song, const TChordGrids* grids = nullptr,
                                      const CGridStyle& style = {});

}  // namespace brindle
