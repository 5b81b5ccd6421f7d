// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CMySet.h"
#include "brindle/theory/CNote.h"

#include <cstddef>
#include <string>
#include <string_view>

namespace brindle::cli {

/// Notes that were typed, or what is wrong with them and where.
struct TNotesText {
    CMySet<CNote> mNotes;
    std::string mError;
    std::size_t mColumn = 0;
};

/// Reads "C4 Eb4 67": keys with their octave, or MIDI numbers of 0 to 127. A key without octave is
/// the next one above the note before it, the first one that of middle C.
[[nodiscard]] TNotesText ReadNotesText(std::string_view text, const CChordNamePrefs& prefs);

/// "C4 Eb4 G4"
[[nodiscard]] std::string NotesName(const CMySet<CNote>& notes, const CChordNamePrefs& prefs);

}  // namespace brindle::cli
