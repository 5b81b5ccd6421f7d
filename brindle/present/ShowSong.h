// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/ShownSong.h"

#include <span>
#include <string>

namespace brindle {

struct CSong;
struct CSongAnalysis;
struct CSongReading;

// What AnalyseSong found in a song, made ready for people and programs.

/// For AnalysisSvg and AnalysisText, with the readings and copies that were asked for.
[[nodiscard]] CShownSong ShowSong(const CSong& song, const CSongAnalysis& found);

/// The chords of a song and the keys of its reading, for KeysSvg.
[[nodiscard]] CShownSong ShowKeys(const CSong& song, const CSongReading& reading);

/// As strict JSON, see docs/json.md.
[[nodiscard]] std::string AnalysisJson(const CSong& song, const CSongAnalysis& found);
/// The same with the reading of the song; `explanations` is a sentence for each chord, or empty.
[[nodiscard]] std::string AnalysisJson(const CSong& song, const CSongAnalysis& found,
                                       const CSongReading& reading,
                                       std::span<const std::string> explanations = {});

}  // namespace brindle
