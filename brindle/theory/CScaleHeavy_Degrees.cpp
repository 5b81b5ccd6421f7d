// SPDX-License-Identifier: MIT
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>

namespace brindle {

int CScaleHeavy::IntvlToDegreeNr(int intvl) const {
    const CScaleRow& row = ScaleRow();
    for (int degree = 0; degree < row.StoredDegreeCount(); ++degree) {
        if (row.OffsetIntvl(degree) == intvl) return degree;
    }
    return -1;
}

int CScaleHeavy::KeyNrToDegreeNr(int keyNr) const {
    if (IsUndef() || mScaleType == st_Undef) return -1;
    const CScaleRow& row = ScaleRow();
    const int rootKeyNr = RootKeyNr();
    for (int degree = 0; degree < row.StoredDegreeCount(); ++degree) {
        if (FoldIntoOctave(std::int64_t{rootKeyNr} + row.OffsetIntvl(degree)) == keyNr) {
            return degree;
        }
    }
    return -1;
}

int CScaleHeavy::NoteNrToDegreeNr(std::int64_t noteNr) const {
    return KeyNrToDegreeNr(KeyNrOfNoteNr(noteNr));
}

int CScaleHeavy::NoteToDegreeNr(const CNote& note) const {
    return KeyNrToDegreeNr(note.KeyNr());
}

int CScaleHeavy::DegreeNrToKeyNr(int degree) const {
    const int rootKeyNr = RootKeyNr();
    const CScaleRow& row = ScaleRow();
    if (IsUndef() || degree < 0 || row.mDegreesPerOctave <= 0) return rootKeyNr;
    return FoldIntoOctave(std::int64_t{rootKeyNr} +
                          row.OffsetIntvl(degree % row.mDegreesPerOctave));
}

CKeyEnh CScaleHeavy::DegreeNrToKeyEnh(int degree) const {
    if (IsUndef()) return CKeyEnh_Undef;
    const int keyNr = DegreeNrToKeyNr(degree);
    return {keyNr, EnhForKeyNr(keyNr)};
}

CNote CScaleHeavy::DegreeNrToNoteInLowestOctave(int degree) const {
    return DegreeNrToNote(degree, -1);
}

std::int64_t CScaleHeavy::DegreeNrToNoteNr(int degree, int oct) const {
    return DegreeNrToNote(degree, oct).mNoteNr;
}

CNote CScaleHeavy::DegreeNrToNote(int degree, int oct) const {
    return {DegreeNrToKeyEnh(degree), oct};
}

CIntvlSet CScaleHeavy::ToIntvlSet() const {
    const CScaleRow& row = ScaleRow();
    const auto offsets = row.mDegreeToRootOffsetIntvl.begin();
    const CMySet<int> intvls(offsets, offsets + row.StoredDegreeCount());
    return CIntvlSet(intvls, 12);
}

CMySet<int> CScaleHeavy::ToKeyNrSet() const {
    return ConvertIntvlSetToKeyNrSet(ToIntvlSet(), RootKeyNr());
}

}  // namespace brindle
