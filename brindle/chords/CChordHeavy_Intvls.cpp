// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>

namespace brindle {

void CChordHeavy::UpdateIntvlSetAndBassNoteHasIntvlAlone() const {
    mIntvlSet.clear();
    mBassNoteHasIntvlAlone = true;
    mIntvlSetNeedsUpdate = false;
    const int bassIntvl = _BassIntvl();
    for (auto note = mNotes.begin(); note != mNotes.end(); ++note) {
        const int intvl = _IntvlOfNote(*note);
        mIntvlSet.insert(intvl);
        if (note != mNotes.begin() && intvl == bassIntvl) mBassNoteHasIntvlAlone = false;
    }
}

int CChordHeavy::_IntvlOfNote(const CNote& note) const {
    // An undefined root or note counts by its number, so the difference is taken without a test;
    // unsigned, because numbers set by hand may lie any distance apart.
    const auto intvl = static_cast<std::int64_t>(static_cast<std::uint64_t>(note.mNoteNr) -
                                                 static_cast<std::uint64_t>(mRootNote.mNoteNr));
    const int wrap = WrapIntvl();
    if (wrap <= 0) return static_cast<int>(intvl);
    const std::int64_t remainder = intvl % wrap;
    return static_cast<int>(remainder < 0 ? remainder + wrap : remainder);
}

const CIntvlSet& CChordHeavy::IntvlSet() const {
    if (mIntvlSetNeedsUpdate) UpdateIntvlSetAndBassNoteHasIntvlAlone();
    return mIntvlSet;
}

int CChordHeavy::WrapIntvl() const {
    return mIntvlSet.WrapIntvl();
}

void CChordHeavy::IntvlSet_SetWrapIntvl(int wrapIntvl) {
    mIntvlSet.SetWrapIntvl(wrapIntvl);
    UpdateIntvlSetAndBassNoteHasIntvlAlone();
}

CSemitones CChordHeavy::Semitones() const {
    return IntvlSet().ToSemitones();
}

int CChordHeavy::Intvl(std::size_t ix) const {
    const CIntvlSet& intvls = IntvlSet();
    return ix < intvls.size() ? *intvls.nth(ix) : kIntvlUndef;
}

bool CChordHeavy::HasIntvl(int intvl) const {
    return IntvlSet().HasIntvl(intvl);
}

bool CChordHeavy::HasIntvlInAnyOctave(int intvl) const {
    return IntvlSet().HasIntvlInAnyOctave(intvl);
}

bool CChordHeavy::HasIntvlInAnyOctaveButNotInBassNoteAlone(int intvl) const {
    return HasIntvlInAnyOctave(intvl) && !BassNoteHasThisIntvlAlone(FoldIntoOctave(intvl));
}

bool CChordHeavy::HasIntvlInAnyOctaveOrRootButNotInBassNoteAlone(int intvl) const {
    return FoldIntoOctave(intvl) == 0 || HasIntvlInAnyOctaveButNotInBassNoteAlone(intvl);
}

bool CChordHeavy::HasOtherStackedThirdsOptionThan(int intvl) const {
    return IntvlSet().HasOtherStackedThirdsOptionThan(intvl);
}

CNote CChordHeavy::IntvlIxToNote(int ix) const {
    if (ix < 0 || static_cast<std::size_t>(ix) >= IntvlSet().size()) return CNote_Undef;
    const int intvl = Intvl(static_cast<std::size_t>(ix));
    return *std::find_if(mNotes.begin(), mNotes.end(),
                         [this, intvl](const CNote& note) { return _IntvlOfNote(note) == intvl; });
}

int CChordHeavy::IntvlIxToKeyNr(int ix) const {
    return IntvlIxToNote(ix).KeyNr();
}

std::string CChordHeavy::IntvlIxToKeyName(int ix) const {
    return IntvlIxToNote(ix).KeyName(CurrentChordNamePrefs);
}

}  // namespace brindle
