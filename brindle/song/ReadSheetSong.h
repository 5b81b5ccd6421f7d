// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/song/CSong.h"

#include <string_view>

namespace brindle {

/// A score that was read once, in both forms.
struct CSheetSong {
    /// As ReadSong gives it, with its faults.
    CSong mSong;
    /// As TMusicXMLDoc::LoadAsPlayedFromBytes gives it.
    TMusicXMLDoc mSheet;
};

/// Reads a score, plain or in a container, for those who need what only one of the forms tells.
[[nodiscard]] CSheetSong ReadSheetSong(std::string_view bytes);

}  // namespace brindle
