// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsCenters.h"
#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/present/ShownSong.h"

namespace brindle {

class CChordSymbols;
struct TMusicXMLDoc;

/// An analysis made ready for the eye. `readings` may be null. The copies are those of
/// MakeSongCopies, as they are wanted by pictures only.
[[nodiscard]] CShownSong MakeSong(const CHarmonicAnalyse& analyse, const CHarmAnlsCenters* readings,
                                  const CChordSymbols& symbols, double beatsPerBar);

/// What a score tells beside its chords.
[[nodiscard]] CShownScore MakeScore(const TMusicXMLDoc& sheet);

}  // namespace brindle
