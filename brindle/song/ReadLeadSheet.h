// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/platform/CTextFault.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace brindle {

/// How the chords of a score follow each other in time.
enum class TLeadSheetTiming : std::uint8_t {
    Played,  ///< as TMusicXMLDoc::LoadAsPlayed does, which is how ReadSong reads scores
    Native,  ///< as TMusicXMLDoc::LoadFromMusicXMLFile does
};

/// A score with its harmonies as they are written, or why it cannot be read.
struct CLeadSheetReading {
    TMusicXMLDoc mSheet;               ///< empty with a fault
    std::optional<CTextFault> mFault;  ///< nothing if there is none
};

/// Reads a score, plain or in a container, for those who need more of it than ReadSong tells: the
/// kinds and degrees of its harmonies, or the other timing.
[[nodiscard]] CLeadSheetReading ReadLeadSheet(std::string_view bytes, TLeadSheetTiming timing);

}  // namespace brindle
