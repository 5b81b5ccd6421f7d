// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/CChordLite.h"
#include "brindle/platform/PlainText.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <ostream>

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

std::ostream& operator<<(std::ostream& stream, const CChordLite& chord) {
    const CChordHeavy named = chord.ToChordHeavy(CChordHeavy::DefaultWrapIntvl);
    stream << "CChordLite: "
           << (chord.IsSlashChord() ? named.NameWithSlash(CurrentChordNamePrefs)
                                    : named.NameWithoutSlash(CurrentChordNamePrefs))
           << "  RootKeyEnh " << chord.mRootKeyEnh.StringForInitializerList() << ", BassKeyEnh "
           << chord.mBassKeyEnh.StringForInitializerList() << ", Semitones ";
    PlainText::WriteUnsigned(stream, chord.mSemitones.Mask());
    return stream;
}

}  // namespace brindle
