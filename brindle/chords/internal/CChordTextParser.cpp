// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/CChordTextParser.h"

namespace brindle::ChordText {

bool CChordTextParser::Read() {
    if (!ReadRoot()) return false;
    if (mScan.Take(':') && ReadColonForm()) return mFault.mFault == TFault::None;
    CutBass();
    ReadQuality();
    return ReadOptions();
}

CChordLite CChordTextParser::Chord() const {
    const CKeyEnh root = mRoot.KeyEnh();
    CKeyEnh bass = mBass ? mBass->KeyEnh() : CKeyEnh_Undef;
    if (bass.mKeyNr == root.mKeyNr) bass = CKeyEnh_Undef;
    return {root, bass, mSemitones.value_or(mTones.Semitones())};
}

bool CChordTextParser::Fail(TFault fault, std::size_t pos, std::size_t length) {
    mFault = {fault, pos, length};
    return false;
}

bool CChordTextParser::ReadRoot() {
    const char first = mScan.Peek();
    mRootIsSmall = Ascii::IsSmallLetter(first);
    const auto note = TakeNote(mScan, mPrefs);
    if (!note) return Fail(TFault::NoNote);
    mRoot = *note;
    if (SeesOneAccidentalTooMany(mScan, mRoot)) {
        return Fail(TFault::OneAccidentalTooMany, mScan.mPos, 1);
    }
    if (mScan.Peek() == 'B') return Fail(TFault::CapitalFlat, mScan.mPos, 1);
    return true;
}

}  // namespace brindle::ChordText
