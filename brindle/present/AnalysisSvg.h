// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/ChordGrid.h"
#include "brindle/present/ShownSong.h"

#include <string>

namespace brindle {

/// An analysis as a picture: chords along a time axis, bands for sign keys, centers, keys, repeated
/// passages and readings. With `grids` (may be null) the fingering of each chord stands under it.
[[nodiscard]] std::string AnalysisSvg(const CShownSong& song, const TChordGrids* grids = nullptr);

}  // namespace brindle
