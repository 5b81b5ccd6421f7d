// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordLite.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {

bool CChordLite::IsSlashChord() const {
    return !IsUndef() && HasBassNote() && mRootKeyEnh != mBassKeyEnh;
}

int CChordLite::KeyIntvlFromRootToBass() const {
    return KeyIntvlFromTo(mRootKeyEnh.mKeyNr, mBassKeyEnh.mKeyNr);
}

int CChordLite::AbsKeyIntvlFromRootToBass() const {
    return AbsKeyIntvlFromTo(mRootKeyEnh.mKeyNr, mBassKeyEnh.mKeyNr);
}

int CChordLite::SmallestKeyIntvlBetweenRootAndBass() const {
    return SmallestKeyIntvlBetween(mRootKeyEnh.mKeyNr, mBassKeyEnh.mKeyNr);
}

int CChordLite::KeyDistanceBetweenRootAndBass() const {
    return KeyDistanceBetween(mRootKeyEnh.mKeyNr, mBassKeyEnh.mKeyNr);
}

bool CChordLite::BassKeyEnhHasIntvlAlone() const {
    // Kept: no tone has a negative interval, so a bass below the root is always alone.
    return !mSemitones.HasIntvl(KeyIntvlFromRootToBass());
}

bool CChordLite::BassKeyEnhHasThisIntvlAlone(int intvl) const {
    return BassKeyEnhHasIntvlAlone() && KeyIntvlFromRootToBass() == intvl;
}

bool CChordLite::HasIntvlButNotInBassKeyEnhAlone(int intvl) const {
    return mSemitones.HasIntvl(intvl);
}

}  // namespace brindle
