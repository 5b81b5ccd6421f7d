// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CMySet.h"
#include "brindle/theory/CNote.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

/// Notes that were typed, or what is wrong with them and where.
struct CNotesText {
    /// All of them as they were typed; MIDI numbers have no spelling.
    std::vector<CNote> mTyped;
    /// Each sounding note once, MIDI numbers with the usual spelling.
    CMySet<CNote> mNotes;
    /// Empty if nothing is wrong, as for a text without notes.
    std::string mError;
    /// In bytes from 0.
    std::size_t mColumn = 0;
};

/// Most notes of a chord: no keyboard has more.
inline constexpr std::size_t kMostTypedNotes = 128;

/// Reads "C4 Eb4 67": keys with their octave, or MIDI numbers of 0 to 127. A key without octave is
/// the next one above the note before it, the first one that of middle C. The octave is that of the
/// letter: Cb4 is below C4.
[[nodiscard]] CNotesText ReadNotesText(std::string_view text, const CChordNamePrefs& prefs);

}  // namespace brindle
