// SPDX-License-Identifier: MIT
#pragma once

#include <optional>
#include <string>

namespace brindle {

struct TMusicXMLDoc;

/// The chords of a score as a chord text, and with which lengths `analyse` reads it back.
struct CChordText {
    std::string mText;            ///< bars between |, holds as dots
    double mBeatsPerBar = 4.0;    ///< quarter notes in each bar of the text
    double mBeatsPerChord = 1.0;  ///< quarter notes that a chord or a dot takes
};

/// Writes four bars a line. An upbeat is filled up to a bar in front. A bar line stands only where
/// a reader with bars of one length sees one, too. Nothing for a song that is too long.
[[nodiscard]] std::optional<CChordText> WriteChordText(const TMusicXMLDoc& sheet);

}  // namespace brindle
