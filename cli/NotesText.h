// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Json.h"

#include "brindle/theory/CMySet.h"
#include "brindle/theory/CNote.h"

#include <cstddef>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace brindle::cli {

/// Notes that were typed, or what is wrong with them and where.
struct CNotesText {
    /// All of them as they were typed; MIDI numbers have no spelling.
    std::vector<CNote> mTyped;
    /// Each sounding note once, MIDI numbers with the usual spelling.
    CMySet<CNote> mNotes;
    std::string mError;
    std::size_t mColumn = 0;
};

/// Most notes of a chord: no keyboard has more.
inline constexpr std::size_t kMostTypedNotes = 128;

/// Reads "C4 Eb4 67": keys with their octave, or MIDI numbers of 0 to 127. A key without octave is
/// the next one above the note before it, the first one that of middle C.
[[nodiscard]] CNotesText ReadNotesText(std::string_view text, const CChordNamePrefs& prefs);

/// "C4 Eb4 G4"
[[nodiscard]] std::string NotesName(std::span<const CNote> notes, const CChordNamePrefs& prefs);

/// A list of names and numbers.
[[nodiscard]] Json NotesToJson(std::span<const CNote> notes, const CChordNamePrefs& prefs);

}  // namespace brindle::cli
