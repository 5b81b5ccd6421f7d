// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/CompingRange.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {

void CChordHeavy::SetSemitones(const CSemitones& semitones) {
    ClearAllExceptRoot();
    if (!mRootNote.IsUndef()) {
        CNote root(mRootNote.KeyEnh(), -1);
        root.SetEnh(mRootNote.mEnh);
        mNotes.insert(root);
    }
    for (const int intvl : semitones.IntvlSet()) AddIntvlInCompingPlusWrapIntvlRange(intvl);
}

void CChordHeavy::SetBasicChord(TBasicChord basicChord) {
    CSemitones semitones;
    semitones.SetFromBasicChord(basicChord);
    SetSemitones(semitones);
}

void CChordHeavy::SetRootKeyNrAndBasicChord(int rootKeyNr, TBasicChord basicChord) {
    SetRootKeyNr(rootKeyNr);
    SetBasicChord(basicChord);
}

void CChordHeavy::AddIntvl(int intvl) {
    CNote note = mRootNote;
    note.AddIntvlAndClampToKey(intvl);
    _AddNoteNrAndIntvlIfNotAlreadyContained(intvl == kIntvlUndef ? kNoteNrUndef : note.mNoteNr);
}

void CChordHeavy::AddIntvlSetAboveRootNote(const CIntvlSet& intvls) {
    for (const int intvl : intvls) AddIntvl(intvl);
}

void CChordHeavy::AddIntvlInCompingRange(int intvl) {
    const bool undefined = mRootNote.IsUndef() || intvl == kIntvlUndef;
    const int keyNr = FoldIntoOctave(std::int64_t{mRootNote.KeyNr()} + intvl);
    _AddNoteNrAndIntvlIfNotAlreadyContained(undefined ? kNoteNrUndef : ToCompingRangeNoteNr(keyNr));
}

void CChordHeavy::AddIntvlSetInCompingRange(const CIntvlSet& intvls) {
    for (const int intvl : intvls) AddIntvlInCompingRange(intvl);
}

void CChordHeavy::AddIntvlInCompingPlusWrapIntvlRange(int intvl) {
    _AddNoteNrAndIntvlIfNotAlreadyContained(
        NoteNrAddIntvlToCompingPlusWrapIntvlRange(mRootNote.mNoteNr, intvl, WrapIntvl()));
}

void CChordHeavy::_AddNoteNrAndIntvlIfNotAlreadyContained(std::int64_t noteNr) {
    const CNote note(noteNr, TEnh_n);
    if (HasNoteNr(note.mNoteNr)) return;
    // The root does not follow: the interval was counted from it.
    mNotes.insert(note);
    mIntvlSetNeedsUpdate = true;
}

}  // namespace brindle
