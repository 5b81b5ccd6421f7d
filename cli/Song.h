// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsCenters.h"
#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/present/ShownSong.h"

namespace brindle {
struct TMusicXMLDoc;
}

namespace brindle::cli {

class CChordSymbols;

/// `readings` may be null.
[[nodiscard]] CShownSong MakeSong(const CHarmonicAnalyse& analyse, const CHarmAnlsCenters* readings,
                                  const CChordSymbols& symbols, double beatsPerBar);

/// The length of the bars of a score by its first time signature; without one, that of most bars.
[[nodiscard]] double BeatsPerBarOf(const TMusicXMLDoc& sheet);

/// The same for the chords of a score.
[[nodiscard]] CShownSong MakeSong(const CHarmonicAnalyse& analyse, const CHarmAnlsCenters* readings,
                                  const CChordSymbols& symbols, const TMusicXMLDoc& sheet);

}  // namespace brindle::cli
