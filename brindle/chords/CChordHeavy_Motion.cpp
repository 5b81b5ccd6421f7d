// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/NoteSearch.h"

#include <algorithm>
#include <utility>

namespace brindle {

namespace {

/// The note moved and limited to 0 to 127, in a spelling that suits its new key.
CNote Moved(CNote note, std::int64_t distance) {
    constexpr std::int64_t farAway = std::int64_t{1} << 40;
    const std::int64_t from = std::clamp(note.mNoteNr, -farAway, farAway);
    note.SetNoteNrAndMakeSensefulEnhAssumingCMajor(
        std::clamp<std::int64_t>(from + distance, 0, 127));
    return note;
}

}  // namespace

void CChordHeavy::Transpose(int intvl) {
    CMySet<CNote> moved;
    for (const CNote& note : mNotes) moved.insert(note.IsUndef() ? note : Moved(note, intvl));
    mNotes = std::move(moved);
    if (!mRootNote.IsUndef()) mRootNote = Moved(mRootNote, intvl);
    mIntvlSetNeedsUpdate = true;
}

void CChordHeavy::Invert() {
    CNote note = LowestNote();
    if (note.IsUndef()) return;
    const std::int64_t highest = HighestNote().mNoteNr;
    mNotes.erase(mNotes.begin());
    note.mNoteNr =
        highest >= 116 ? 108 + note.KeyNr() : NoteNrOfKeyNrLargerThan(note.KeyNr(), highest);
    mNotes.insert(note);
    mIntvlSetNeedsUpdate = true;
}

void CChordHeavy::ChangeAllNotesWithinIntvlRange(int lo, int hi, int target) {
    if (mRootNote.IsUndef()) return;
    bool anyMoved = false;
    CMySet<CNote> moved;
    for (const CNote& note : mNotes) {
        const int intvl = AbsKeyIntvlFromTo(mRootNote.KeyNr(), note.KeyNr());
        if (note.IsUndef() || intvl < lo || intvl > hi) {
            moved.insert(note);
            continue;
        }
        const std::int64_t distance = std::int64_t{target} - intvl;
        anyMoved = anyMoved || distance != 0;
        // Kept: a far target is left behind instead of reached.
        moved.insert(Moved(note, distance > 5 ? -distance : distance));
    }
    if (!anyMoved) return;
    mNotes = std::move(moved);
    mIntvlSetNeedsUpdate = true;
}

}  // namespace brindle
