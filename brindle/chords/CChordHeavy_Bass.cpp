// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/CompingRange.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {

CKeyEnh CChordHeavy::BassKeyEnh() const {
    return LowestNote().KeyEnh();
}

bool CChordHeavy::BassNoteIsInLowestOctave() const {
    const CNote lowest = LowestNote();
    return lowest.mNoteNr >= 0 && lowest.mNoteNr <= 11;
}

bool CChordHeavy::IsSlashChord() const {
    const CNote lowest = LowestNote();
    return !mRootNote.IsUndef() && !lowest.IsUndef() && lowest.KeyNr() != mRootNote.KeyNr();
}

bool CChordHeavy::BassNoteHasIntvlAlone() const {
    if (mIntvlSetNeedsUpdate) UpdateIntvlSetAndBassNoteHasIntvlAlone();
    return mBassNoteHasIntvlAlone;
}

bool CChordHeavy::BassNoteHasThisIntvlAlone(int intvl) const {
    return intvl != kIntvlUndef && _BassIntvl() == intvl && BassNoteHasIntvlAlone();
}

int CChordHeavy::_BassIntvl() const {
    return AbsKeyIntvlFromTo(mRootNote.KeyNr(), LowestNote().KeyNr());
}

void CChordHeavy::SetBassKeyEnh(const CKeyEnh& bass) {
    DeleteAllNotesInOctave(-1);
    if (!bass.IsUndef()) SetBassNoteInOctave(bass.mKeyNr, -1, bass.mEnh);
}

void CChordHeavy::RemoveBassNote() {
    SetBassKeyEnh(CKeyEnh_Undef);
}

void CChordHeavy::SetBassNoteInOctave(int keyNr, int octave, TEnh enh) {
    CNote bass(CKeyEnh{keyNr, enh}, octave);
    bass.SetEnh(enh);
    AddNote(bass);
}

void CChordHeavy::SetBassNoteAloneInOctave(int keyNr, int octave, TEnh enh) {
    _DelNotesOfKeyNr(keyNr);
    SetBassNoteInOctave(keyNr, octave, enh);
}

void CChordHeavy::AddBassNoteKeepingFormer(const CNote& note) {
    if (note.IsUndef()) return;
    if (BassNoteIsInLowestOctave()) {
        CNote former = LowestNote();
        mNotes.erase(mNotes.begin());
        former.mNoteNr = ToCompingRangeNoteNr(former.mNoteNr);
        mNotes.insert(former);
    }
    CNote bass = note;
    bass.mNoteNr = note.KeyNr();
    AddNote(bass);
}

void CChordHeavy::SetBassNoteDeletingFormer(const CNote& note) {
    if (!mNotes.empty()) DelNote(std::size_t{0});
    AddBassNoteKeepingFormer(note);
}

}  // namespace brindle
