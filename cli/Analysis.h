// SPDX-License-Identifier: MIT
#pragma once

#include "cli/GridDatabase.h"
#include "cli/Output.h"
#include "cli/Song.h"

#include <string>

namespace brindle::cli {

class CChordSymbols;

// The presentations of an analysis.

/// For people: a line for each sign key, under it its centers, under these their chords.
[[nodiscard]] std::string AnalysisText(const TSong& song, const CPaint& paint);

/// Strict JSON, see docs/json.md. `readings` and `sheet` may be null.
[[nodiscard]] std::string AnalysisJson(const CHarmonicAnalyse& analyse,
                                       const CHarmAnlsCenters* readings,
                                       const CChordSymbols& symbols, const TSongKeys& keys,
                                       const TMusicXMLDoc* sheet = nullptr);

/// A picture: chords along a time axis, bands for sign keys, centers and readings; with `grids` the
/// fingering of each chord under it.
[[nodiscard]] std::string AnalysisSvg(const TSong& song, const TChordGrids* grids = nullptr);

}  // namespace brindle::cli
