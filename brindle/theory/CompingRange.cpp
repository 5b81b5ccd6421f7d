// SPDX-License-Identifier: MIT
#include "brindle/theory/CompingRange.h"

#include "brindle/theory/CNote.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {

std::int64_t ToCompingRangeNoteNr(std::int64_t noteNr) {
    if (IsNoteNrUndef(noteNr)) return kNoteNrUndef;
    return NoteNrToCompingPlusWrapIntvlRange(noteNr, kCompingRangeWidth);
}

// In steps: the wrap interval is added until it has been added at or above the start of the range,
// then taken away until the note is at or below its end. So a note from below ends on the lowest
// place in the range, one from above on the highest, and the two differ when the start's own key
// is sought. Here the same without walking.
std::int64_t NoteNrToCompingPlusWrapIntvlRange(std::int64_t noteNr, int wrapIntvl) {
    if (wrapIntvl < 1) return noteNr;
    const std::int64_t wrap = wrapIntvl;
    const std::int64_t end = kCompingRangeStartNoteNr + wrap;
    if (noteNr >= kCompingRangeStartNoteNr && noteNr <= end) return noteNr;
    const std::int64_t remainder = (noteNr % wrap - kCompingRangeStartNoteNr % wrap) % wrap;
    const std::int64_t aboveStart = remainder < 0 ? remainder + wrap : remainder;
    const bool endsOnTop = aboveStart == 0 && noteNr > end;
    return endsOnTop ? end : kCompingRangeStartNoteNr + aboveStart;
}

std::int64_t NoteNrAddIntvlToCompingPlusWrapIntvlRange(std::int64_t noteNr, int intvl,
                                                       int wrapIntvl) {
    if (IsNoteNrUndef(noteNr) || intvl == kIntvlUndef || wrapIntvl == kIntvlUndef) {
        return kNoteNrUndef;
    }
    return NoteNrToCompingPlusWrapIntvlRange(NoteNrAddIntvl(noteNr, intvl), wrapIntvl);
}

std::int64_t KeyNrAddIntvlToCompingPlusWrapIntvlRange(int keyNr, int intvl, int wrapIntvl) {
    if (keyNr == kKeyNrUndef || intvl == kIntvlUndef || wrapIntvl == kIntvlUndef) {
        return kNoteNrUndef;
    }
    return NoteNrToCompingPlusWrapIntvlRange(std::int64_t{keyNr} + intvl, wrapIntvl);
}

}  // namespace brindle
