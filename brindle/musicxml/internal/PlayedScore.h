// SPDX-License-Identifier: MIT
#pragma once

namespace brindle {

struct TMusicXMLDoc;
struct TWrittenScore;

/// Appends what a score holds to `doc`, in playing order. False when the song was cut at
/// kMaxPlayedMeasures or kMaxPlayedBytes.
bool LayOutAsPlayed(const TWrittenScore& score, TMusicXMLDoc& doc);

}  // namespace brindle
