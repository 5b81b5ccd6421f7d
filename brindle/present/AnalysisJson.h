// SPDX-License-Identifier: MIT
#pragma once

#include <span>
#include <string>

namespace brindle {

struct CSong;
struct CSongAnalysis;
struct CSongReading;
struct TMusicXMLDoc;

/// What AnalyseSong found in a song as strict JSON, see docs/json.md. A score has one more member
/// in front, `Score`.
[[nodiscard]] std::string AnalysisJson(const CSong& song, const CSongAnalysis& found);
/// The same with the reading of the song; `explanations` is a sentence for each chord, or empty.
[[nodiscard]] std::string AnalysisJson(const CSong& song, const CSongAnalysis& found,
                                       const CSongReading& reading,
                                       std::span<const std::string> explanations = {});

/// The same for what AnalyseSheet found in a score.
[[nodiscard]] std::string AnalysisJson(const TMusicXMLDoc& sheet, const CSongAnalysis& found);

}  // namespace brindle
