// SPDX-License-Identifier: MIT
// What leads to a dominant: augmented sixths, the Neapolitan chord, and the second that belongs to
// a dominant.

#include "brindle/analysis/internal/HarmonyRules.h"

namespace brindle {
namespace {

void BeAugmentedSixth(std::string_view numeral, std::ptrdiff_t goal, CChordName& name) {
    name.Be(TChordRelation_AugmentedSixth, THarmFunction_Subdominant);
    name.mReading.mNumeral = numeral;
    name.LeadTo(goal);
}

std::string_view SixthName(const CChordInSong& chord) {
    return chord.Has(7) ? "Ger6" : "It6";
}

// Ab C D F# counted from its bass, as scores tell it.
std::string_view WrittenSixthName(const CChordInSong& chord) {
    return chord.Has(6) && !chord.Has(7) ? "Fr6" : SixthName(chord);
}

// Ab7 before G in C, where the seventh wants to rise: F sharp. In jazz it is a substitute dominant.
bool NameGermanSixth(const CChordInSong& chord, CChordName& name) {
    if (!chord.Is(TKeyChordClass_Dom) || chord.Degree() != 8 || chord.Traits().mIsJazz) {
        return false;
    }
    if (chord.NextEffectiveDegree() != 7) return false;
    BeAugmentedSixth(SixthName(chord), chord.Next(), name);
    return true;
}

// Ab7 written with F sharp falls to the dominant of something, wherever it stands: before D in C
// major Eb7 is Ger6/V.
bool NameWrittenSixth(const CChordInSong& chord, CChordName& name) {
    if (!chord.Is(TKeyChordClass_Dom) || !chord.Has(10)) return false;
    if (chord.UpToNext() != kSemitoneDown) return false;
    const int target = FoldIntoOctave(chord.Degree() - 8);
    Apply(chord, WrittenSixthName(chord), target, chord.Next(), name);
    std::string& numeral = name.mReading.mNumeral;
    numeral = WrittenSixthName(chord);
    if (target != 0) numeral += '/' + name.mReading.mServes.Name();
    name.Be(TChordRelation_AugmentedSixth, THarmFunction_Subdominant);
    return true;
}

// Ab C D F#, as D7 with a lowered fifth in the bass.
bool NameFrenchSixth(const CChordInSong& chord, CChordName& name) {
    const bool hasFlatFifth = chord.Has(6) && !chord.Has(7);
    if (!chord.Is(TKeyChordClass_Dom) || chord.Degree() != 2 || chord.Traits().mIsJazz ||
        !hasFlatFifth || chord.BassDegree() != 8) {
        return false;
    }
    BeAugmentedSixth("Fr6", chord.Goal(kFourthUp), name);
    return true;
}

bool NameNeapolitan(const CChordInSong& chord, CChordName& name) {
    if (!chord.Is(TKeyChordClass_Triad) || chord.Degree() != 1) return false;
    name.Be(TChordRelation_Neapolitan, THarmFunction_Subdominant);
    const bool isSixth = chord.BassDegree() == 5;
    name.mReading.mNumeral = isSixth ? "N6" : "N";
    return true;
}

bool IsMinorOrHalfDiminished(const CChordInSong& chord) {
    return chord.Is(TKeyChordClass_Min) || chord.Is(TKeyChordClass_Min7) ||
           chord.Is(TKeyChordClass_HDim);
}

// ii of the dominant's target; in its own key's numeral where it is at home there, or where the
// dominant is a substitute.
bool NameSecondOfDominant(const CChordInSong& chord, const CChordReading& dominant,
                          bool isSubstitute, CChordName& name) {
    const TKeyChordClass next = chord.ChordAt(chord.Next()).mClass;
    const bool isHeldBack = next == TKeyChordClass_Triad && !chord.Is(TKeyChordClass_Min);
    if (next != TKeyChordClass_Dom && next != TKeyChordClass_Open && !isHeldBack) return false;
    name.Be(TChordRelation_RelatedSecond, THarmFunction_Subdominant);
    const bool isAtHome = chord.IsDiatonic() && !chord.Is(TKeyChordClass_HDim);
    name.mReading.mServes = dominant.mServes;
    const bool isOwn = isSubstitute || dominant.mServes.IsTonic() || isAtHome;
    if (!isOwn) WriteServingNumeral(chord, "ii", name.mReading);
    name.LeadTo(chord.Next());
    return true;
}

}  // namespace

bool NamePredominant(const CChordInSong& chord, CChordName& name) {
    if (chord.Seventh() == TSeventhSpelling_AugmentedSixth && NameWrittenSixth(chord, name)) {
        return true;
    }
    const bool maySoundAsSixth = chord.Seventh() != TSeventhSpelling_MinorSeventh;
    return (maySoundAsSixth && NameGermanSixth(chord, name)) || NameFrenchSixth(chord, name) ||
           NameNeapolitan(chord, name);
}

bool NameRelatedSecond(const CChordInSong& chord, CChordName& name) {
    if (!IsMinorOrHalfDiminished(chord) || !chord.HasNext()) return false;
    const CChordReading& next = chord.ReadingAt(chord.Next());
    const int up = FoldIntoOctave(chord.DegreeBehind() - chord.Degree());
    const bool isSubstitute = next.mRelation == TChordRelation_SubstituteDominant;
    const bool isDominant = next.mRelation == TChordRelation_Dominant;
    if (up == kFourthUp && (isDominant || isSubstitute) &&
        NameSecondOfDominant(chord, next, isSubstitute, name)) {
        return true;
    }
    if (up == kSemitoneDown && isSubstitute && chord.Degree() == 2) {
        name.Be(TChordRelation_RelatedSecond, THarmFunction_Subdominant);
        name.mReading.mServes = next.mServes;
        name.LeadTo(chord.Next());
        return true;
    }
    const bool isBeforeBackdoor = up == kFourthUp && chord.Degree() == 5 && chord.IsInMajor() &&
                                  next.mRelation == TChordRelation_Backdoor;
    if (!isBeforeBackdoor) return false;
    name.Be(TChordRelation_Backdoor, THarmFunction_Subdominant);
    name.LeadTo(chord.Next());
    return true;
}

}  // namespace brindle
