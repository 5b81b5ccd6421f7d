// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/ChordInSong.h"

namespace brindle {
namespace {

constexpr int kDominantDegree = 7;

bool IsMinorSeventh(const CKeyChord& chord) {
    return chord.mClass == TKeyChordClass_Min7 || chord.mClass == TKeyChordClass_HDim;
}

}  // namespace

CChordInSong::CChordInSong(const CSongToName& song, std::size_t ix)
    : mSong(song),
      mIx(static_cast<std::ptrdiff_t>(ix)),
      mChord(song.mChords[ix]),
      mKey(song.mKeys[ix]),
      mDegree(DegreeInKey(mChord.mRoot, mKey)),
      mNext(ix + 1 < song.mChords.size() ? mIx + 1 : kNoChord),
      mDegreeBehind(DegreeOf(mNext)) {
    if (mNext < 0) return;
    mNextEffectiveDegree = EffectiveDegree(mNext);
    mUpToNext = FoldIntoOctave(mNextEffectiveDegree - mDegree);
}

int CChordInSong::EffectiveDegree(std::ptrdiff_t ix) const {
    const CKeyChord& chord = ChordAt(ix);
    const int degree = DegreeInKey(chord.mRoot, mKey);
    const bool isTriad = chord.mClass == TKeyChordClass_Triad || chord.mClass == TKeyChordClass_Min;
    const bool isSixFour = degree == 0 && isTriad && DegreeInKey(chord.mBass, mKey) == 7;
    return isSixFour ? kDominantDegree : degree;
}

std::ptrdiff_t CChordInSong::Goal(int up) const {
    if (mNext < 0) return kNoChord;
    if (mUpToNext == up) return mNext;
    const std::ptrdiff_t goal = TargetOf(mNext);
    if (goal < 0 || FoldIntoOctave(EffectiveDegree(goal) - mDegree) != up) return kNoChord;
    return IsHeardThrough(goal) ? goal : kNoChord;
}

// Whether the next chord only delays the goal: it is of the same root, or a second before it, or
// stands between the dominant and its tonic.
bool CChordInSong::IsHeardThrough(std::ptrdiff_t goal) const {
    const int upFromNext = FoldIntoOctave(EffectiveDegree(goal) - mDegreeBehind);
    if (upFromNext == 0) return true;
    const CKeyChord& next = ChordAt(mNext);
    if (upFromNext == 5 && (IsMinorSeventh(next) || next.mClass == TKeyChordClass_Min)) return true;
    return mDegree == kDominantDegree && CSemitones{2, 5, 8}.HasIntvl(mDegreeBehind);
}

bool CChordInSong::IsPrepared() const {
    return HasPrevious() && IsMinorSeventh(ChordAt(Previous())) && UpFrom(ChordAt(Previous())) == 5;
}

}  // namespace brindle
