// SPDX-License-Identifier: MIT
// The chords that no other chord explains: those of the key, those of its parallel key, and what is
// left.

#include "brindle/analysis/internal/HarmonyRules.h"

namespace brindle {
namespace {

bool IsPlainMinor(TKeyChordClass chordClass) {
    return chordClass == TKeyChordClass_Min || chordClass == TKeyChordClass_Min7;
}

// A minor chord on the same root with other tones above it.
bool IsAlike(const CChordInSong& chord, std::ptrdiff_t other) {
    if (other < 0 || other >= static_cast<std::ptrdiff_t>(chord.Count())) return false;
    const CKeyChord& otherChord = chord.ChordAt(other);
    return otherChord.mRoot == chord.Chord().mRoot && IsPlainMinor(otherChord.mClass) &&
           otherChord.mSemitones != chord.Chord().mSemitones;
}

// At least the second of three minor chords on one root.
bool IsInLine(const CChordInSong& chord) {
    if (!IsPlainMinor(chord.Class()) || !IsAlike(chord, chord.Previous())) return false;
    return IsAlike(chord, chord.Previous() - 1) || IsAlike(chord, chord.Next());
}

bool IsTonic(const CChordInSong& chord) {
    const bool isMinorTonic = IsPlainMinor(chord.Class()) && !chord.IsInMajor();
    return chord.Degree() == 0 &&
           (chord.IsDiatonic() || chord.Is(TKeyChordClass_Open) || isMinorTonic);
}

bool IsPlagal(const CChordInSong& chord) {
    if (chord.Degree() != 5 || !chord.IsDiatonic()) return false;
    return chord.DegreeBehind() == 0 || chord.DegreeOf(chord.Target()) == 0;
}

bool IsMediant(const CChordInSong& chord) {
    const bool isMajor = chord.Is(TKeyChordClass_Triad) || chord.Is(TKeyChordClass_Maj7) ||
                         chord.Is(TKeyChordClass_Dom);
    return !chord.IsDiatonic() && isMajor && CSemitones{3, 4, 8, 9}.HasIntvl(chord.Degree());
}

}  // namespace

void NameChordOfKey(const CChordInSong& chord, CChordName& name) {
    CChordReading& reading = name.mReading;
    const bool isSixFour = chord.EffectiveDegree(chord.Index()) != chord.Degree();
    if (isSixFour && chord.DegreeBehind() == 7) {
        name.Be(TChordRelation_Dominant, THarmFunction_Dominant);
        name.LeadTo(chord.Next());
    } else if (IsInLine(chord)) {
        reading.mRelation = TChordRelation_LineCliche;
    } else if (IsTonic(chord)) {
        name.Be(TChordRelation_Tonic, THarmFunction_Tonic);
    } else if (IsPlagal(chord)) {
        name.Be(TChordRelation_Plagal, THarmFunction_Subdominant);
        if (chord.DegreeBehind() == 0) name.LeadTo(chord.Next());
    } else if (!chord.IsDiatonic() && chord.IsInParallelScale()) {
        reading.mRelation = TChordRelation_Borrowed;
    } else if (IsMediant(chord)) {
        name.Be(TChordRelation_ChromaticMediant, THarmFunction_Tonic);
    }
}

}  // namespace brindle
