// SPDX-License-Identifier: MIT
// Diminished chords: those that lead a semitone up, those that the bass passes through, and those
// around a chord that shares a tone with them.

#include "brindle/analysis/internal/HarmonyRules.h"
#include "brindle/analysis/internal/NumeralText.h"

namespace brindle {
namespace {

// How far the bass moves on to the next chord, 0 at the end.
int StepOfNextBass(const CChordInSong& chord) {
    if (!chord.HasNext()) return 0;
    return DegreeInKey(chord.ChordAt(chord.Next()).mBass, chord.Chord().mRoot);
}

// The bass comes by a semitone and goes on by one in the same direction.
bool IsBySteps(const CChordInSong& chord) {
    if (!chord.Is(TKeyChordClass_Dim) || !chord.HasPrevious()) return false;
    const int step = StepOfNextBass(chord);
    const int stepBefore = DegreeInKey(chord.Chord().mRoot, chord.ChordAt(chord.Previous()).mBass);
    return (step == 1 || step == 11) && stepBefore == step;
}

// A chord without a function of its own. On its way up it is written as the raised degree below:
// #iio7 between ii and iii.
void BePassing(const CChordInSong& chord, TChordRelation relation, CChordName& name) {
    name.Be(relation, THarmFunction_None);
    name.LeadTo(chord.Next());
    const bool isRaised = chord.IsInMajor() && StepOfNextBass(chord) == 1 &&
                          CSemitones{1, 3, 8}.HasIntvl(chord.Degree());
    if (!isRaised) return;
    std::string& numeral = name.mReading.mNumeral;
    numeral = '#';
    AppendDegree(numeral, NumeralDegreeOf(chord.Degree() - 1, chord.Key()), true);
    numeral += NumeralSignOf(chord.Chord().mSemitones);
}

bool BeLeading(const CChordInSong& chord, int target, std::ptrdiff_t goal, CChordName& name) {
    name.mReading.mRelation = TChordRelation_LeadingDiminished;
    Apply(chord, "vii", target, goal, name);
    return true;
}

// The tones of a diminished seventh chord lie three semitones apart, so each can be its root:
// before Dm Bbo7 is C#o7.
bool NameInverted(const CChordInSong& chord, CChordName& name) {
    if (!chord.HasNext()) return false;
    const int target = chord.NextEffectiveDegree();
    const bool leads = chord.UpToNext() % 3 == 1 && chord.IsDegreeOfScale(target);
    return leads && BeLeading(chord, target, chord.Next(), name);
}

bool SharesTonesWithNext(const CChordInSong& chord) {
    return chord.HasNext() && FoldIntoOctave(chord.DegreeBehind() - chord.Degree()) % 3 == 0;
}

bool NameLeading(const CChordInSong& chord, bool leads, bool isBySteps, CChordName& name) {
    const int up = FoldIntoOctave(chord.Degree() + 1);
    if (leads) {
        BeLeading(chord, up, chord.Next(), name);
        if (isBySteps) name.mReading.mRelation = TChordRelation_PassingDiminished;
        return true;
    }
    if (up == 0) return BeLeading(chord, 0, kNoChord, name);
    const bool isApplied =
        !chord.Traits().mIsJazz && !chord.IsDiatonic() && chord.IsDegreeOfScale(up);
    return isApplied && BeLeading(chord, up, kNoChord, name);
}

}  // namespace

bool NameDiminished(const CChordInSong& chord, CChordName& name) {
    const bool leads = chord.UpToNext() == 1;
    const bool isLeadingHalfDiminished =
        chord.Is(TKeyChordClass_HDim) && leads && chord.Degree() != 2;
    if (!chord.Is(TKeyChordClass_Dim) && !isLeadingHalfDiminished) return false;
    const bool isBySteps = IsBySteps(chord);
    const bool isOnlyPassing = chord.Traits().mIsJazz || StepOfNextBass(chord) == 11 || !leads;
    if (isBySteps && isOnlyPassing) {
        BePassing(chord, TChordRelation_PassingDiminished, name);
        return true;
    }
    if (NameLeading(chord, leads, isBySteps, name)) return true;
    if (!chord.Has(9)) return false;
    if (SharesTonesWithNext(chord)) {
        BePassing(chord, TChordRelation_CommonToneDiminished, name);
        return true;
    }
    if (!NameInverted(chord, name)) BePassing(chord, TChordRelation_PassingDiminished, name);
    return true;
}

}  // namespace brindle
