// SPDX-License-Identifier: MIT
#include "brindle/theory/NoteSearch.h"

#include "brindle/theory/CNote.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>

namespace brindle {

namespace {

bool IsUndef(int keyNr, std::int64_t noteNr) {
    return keyNr == kKeyNrUndef || IsNoteNrUndef(noteNr);
}

/// From further off the keyboard every search ends on the same limit.
std::int64_t NearKeyboard(std::int64_t noteNr) {
    return std::clamp<std::int64_t>(noteNr, -12, 139);
}

std::int64_t OnKeyboard(std::int64_t noteNr) {
    return std::clamp<std::int64_t>(noteNr, 0, 127);
}

}  // namespace

std::int64_t NoteNrOfKeyNrLargerOrEqualTo(int keyNr, std::int64_t noteNr) {
    if (IsUndef(keyNr, noteNr)) return kNoteNrUndef;
    const std::int64_t from = NearKeyboard(noteNr);
    return OnKeyboard(from + FoldIntoOctave(keyNr - from));
}

std::int64_t NoteNrOfKeyNrLargerThan(int keyNr, std::int64_t noteNr) {
    const std::int64_t found = NoteNrOfKeyNrLargerOrEqualTo(keyNr, noteNr);
    if (found == kNoteNrUndef) return kNoteNrUndef;
    return found == noteNr ? found + 12 : found;
}

std::int64_t NoteNrOfKeyNrSmallerOrEqualTo(int keyNr, std::int64_t noteNr) {
    if (IsUndef(keyNr, noteNr)) return kNoteNrUndef;
    const std::int64_t from = NearKeyboard(noteNr);
    return OnKeyboard(from - FoldIntoOctave(from - keyNr));
}

std::int64_t NoteNrOfKeyNrSmallerThan(int keyNr, std::int64_t noteNr) {
    const std::int64_t found = NoteNrOfKeyNrSmallerOrEqualTo(keyNr, noteNr);
    if (found == kNoteNrUndef) return kNoteNrUndef;
    const std::int64_t below = found == noteNr ? found - 12 : found;
    if (below >= 0) return below;
    return noteNr == 0 ? -12 : 0;
}

std::int64_t NoteNrWithSameKeyNrLargerOrEqualTo(std::int64_t model, std::int64_t noteNr) {
    return NoteNrOfKeyNrLargerOrEqualTo(KeyNrOfNoteNr(model), noteNr);
}

std::int64_t NoteNrWithSameKeyNrLargerThan(std::int64_t model, std::int64_t noteNr) {
    return NoteNrOfKeyNrLargerThan(KeyNrOfNoteNr(model), noteNr);
}

}  // namespace brindle
