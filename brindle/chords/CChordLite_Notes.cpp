// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/CChordLite.h"

namespace brindle {

CChordHeavy CChordLite::ToChordHeavy(int wrapIntvl) const {
    if (IsNoChordForce()) return CChordHeavy_NoChordForce();
    if (IsNoChordYield()) return CChordHeavy_NoChordYield();
    if (IsUndef()) return CChordHeavy(wrapIntvl);
    return {mRootKeyEnh, mSemitones, mBassKeyEnh, wrapIntvl};
}

void CChordLite::SetFromChordHeavy(const CChordHeavy& chord) {
    mRootKeyEnh = chord.RootKeyEnh();
    mBassKeyEnh = {};

    CSemitones semitones = chord.Semitones();
    const CNote lowest = chord.LowestNote();
    const bool inLowestOctave = lowest.mNoteNr >= 0 && lowest.mNoteNr <= 11;
    if (inLowestOctave && lowest.KeyEnh() != mRootKeyEnh) {
        mBassKeyEnh = lowest.KeyEnh();
        if (chord.BassNoteHasIntvlAlone()) semitones.EraseIntvl(KeyIntvlFromRootToBass());
    }
    if (IsUndef()) return;
    semitones.AddIntvl(0);
    mSemitones = semitones;
}

}  // namespace brindle
