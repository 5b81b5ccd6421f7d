// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/ShownSong.h"

#include <string>

namespace brindle {

struct CSong;
struct CSongAnalysis;

// What AnalyseSong found in a song, made ready for people and programs.

/// For AnalysisSvg and AnalysisText, with the readings and copies that were asked for.
[[nodiscard]] CShownSong ShowSong(const CSong& song, const CSongAnalysis& found);

/// As strict JSON, see docs/json.md.
[[nodiscard]] std::string AnalysisJson(const CSong& song, const CSongAnalysis& found);

}  // namespace brindle
