// SPDX-License-Identifier: MIT
#include "brindle/theory/CNote.h"

#include "brindle/theory/EnhShift.h"
#include "brindle/theory/KeyIntervals.h"

#include <ostream>

namespace brindle {

void CNote::SetNoteNrAndEnh(std::int64_t noteNr, TEnh enh) {
    *this = CNote(noteNr, enh);
}

void CNote::SetNoteNrAndMakeSensefulEnhAssumingCMajor(std::int64_t noteNr) {
    SetNoteNr(noteNr);
    MakeSensefulEnhAssumingCMajor();
}

void CNote::SetKeyNr(int keyNr) {
    if (keyNr == kKeyNrUndef) {
        mNoteNr = kNoteNrUndef;
        return;
    }
    const std::int64_t octIndex = mNoteNr == kNoteNrSmallUndef ? -1 : mNoteNr / 12;
    mNoteNr = NoteNrAddIntvl(octIndex * 12, FoldIntoOctave(keyNr));
}

void CNote::SetKeyNrAndEnhAssumingCMajor(int keyNr) {
    SetKeyNr(keyNr);
    MakeSensefulEnhAssumingCMajor();
}

void CNote::SetOct(int oct) {
    mNoteNr = _NoteNrFromKeyNrAndOct(IsUndef() ? 0 : KeyNr(), oct);
}

void CNote::Clear() {
    SetNoteNrAndMakeSensefulEnhAssumingCMajor(kNoteNrUndef);
}

void CNote::EnhShiftToFlats() {
    mEnh = EnhShiftToFlatsUnclamped(KeyNr(), mEnh);
}

void CNote::EnhShiftToSharps() {
    mEnh = EnhShiftToSharpsUnclamped(KeyNr(), mEnh);
}

void CNote::EnhShift() {
    mEnh = EnhShiftUnclamped(KeyNr(), mEnh);
}

void CNote::AddIntvlAndClampToKey(int intvl) {
    if (IsUndef()) return;
    const std::int64_t sum = NoteNrAddIntvl(mNoteNr, intvl);
    const int key = FoldIntoOctave(sum);
    constexpr int kKeyOfHighestNote = 127 % 12;
    const int highestOfKey = (key <= kKeyOfHighestNote ? 120 : 108) + key;
    mNoteNr = sum < 0 ? key : std::min<std::int64_t>(sum, highestOfKey);
}

std::ostream& operator<<(std::ostream& stream, const CNote& note) {
    return stream << note.mNoteNr << ' ' << note.mEnh;
}

}  // namespace brindle
