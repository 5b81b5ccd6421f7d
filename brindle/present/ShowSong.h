// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/ShownSong.h"

namespace brindle {

struct CSong;
struct CSongAnalysis;
struct CSongReading;
struct TMusicXMLDoc;

// What AnalyseSong found in a song, made ready for the eye.

/// For AnalysisSvg and CentersText, with the readings and copies that were asked for.
[[nodiscard]] CShownSong ShowSong(const CSong& song, const CSongAnalysis& found);
/// The same for what AnalyseSheet found in a score.
[[nodiscard]] CShownSong ShowSong(const TMusicXMLDoc& sheet, const CSongAnalysis& found);

/// The chords of a song and the keys of its reading, for KeysSvg.
[[nodiscard]] CShownSong ShowKeys(const CSong& song, const CSongReading& reading);

}  // namespace brindle
