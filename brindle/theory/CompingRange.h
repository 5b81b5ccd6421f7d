// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

// The comping range is the octave around middle C, F to F, in which chords are voiced unless told
// otherwise.

/// The F below middle C.
inline constexpr std::int64_t kCompingRangeStartNoteNr = 53;
/// In semitones.
inline constexpr int kCompingRangeWidth = 12;
/// The F above middle C; it is inside, too.
inline constexpr std::int64_t kCompingRangeEndNoteNr = 65;
/// An octave number for hosts; nothing here reads it.
inline constexpr int kCompingRangeBelowOctNr = 4;

/// Whether the note number is 53 to 65, both included.
[[nodiscard]] constexpr bool IsNoteNrInCompingRange(std::int64_t noteNr) {
    return noteNr >= kCompingRangeStartNoteNr && noteNr <= kCompingRangeEndNoteNr;
}

/// The note moved by whole octaves into 53 to 65. An F is there twice: from below it ends on 53,
/// from above on 65. Undefined stays undefined, as -1.
[[nodiscard]] std::int64_t ToCompingRangeNoteNr(std::int64_t noteNr);

/// The note moved by multiples of `wrapIntvl` into 53 to 53 plus `wrapIntvl`, both ends as in
/// ToCompingRangeNoteNr. A wrap interval below 1 moves nothing.
[[nodiscard]] std::int64_t NoteNrToCompingPlusWrapIntvlRange(std::int64_t noteNr, int wrapIntvl);
/// The note `intvl` above `noteNr`, moved in the same way. -1 when the note or an interval is
/// undefined.
[[nodiscard]] std::int64_t NoteNrAddIntvlToCompingPlusWrapIntvlRange(std::int64_t noteNr, int intvl,
                                                                     int wrapIntvl);
/// The same from a key number, 0 to 11; key 15 gives -1.
[[nodiscard]] std::int64_t KeyNrAddIntvlToCompingPlusWrapIntvlRange(int keyNr, int intvl,
                                                                    int wrapIntvl);

}  // namespace brindle
