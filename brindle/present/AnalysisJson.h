// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/present/ReadingJson.h"
#include "brindle/present/ShownSong.h"

#include <functional>
#include <string>

namespace brindle {

struct TMusicXMLDoc;

/// The symbol that stands for a chord of an analysis; empty for none.
using TSymbolOfChord = std::function<const std::string&(const CHarmAnlsChordWithPos&)>;

/// An analysis as strict JSON, see docs/json.md. `readings` and `sheet`, the score that the song
/// comes from, and `song`, its reading, may be null.
[[nodiscard]] std::string AnalysisJson(const CHarmonicAnalyse& analyse,
                                       const CHarmAnlsCenters* readings,
                                       const TSymbolOfChord& symbolOf, const CShownKeys& keys,
                                       const TMusicXMLDoc* sheet = nullptr,
                                       const CReadSong* song = nullptr);

}  // namespace brindle
