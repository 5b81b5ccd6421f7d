// SPDX-License-Identifier: MIT
// Dominants: those of the key, those of its degrees, their substitutes a tritone away, and the
// seventh chords that want nothing, as in a blues.

#include "brindle/analysis/internal/HarmonyRules.h"

namespace brindle {
namespace {

bool IsDom(const CChordInSong& chord) {
    return chord.Is(TKeyChordClass_Dom);
}

// A major chord that the key does not have wants to go on even without a seventh: D in C major.
bool IsStrong(const CChordInSong& chord) {
    return IsDom(chord) || (chord.Is(TKeyChordClass_Triad) && !chord.IsDiatonic());
}

bool Resolves(const CChordInSong& chord) {
    if (chord.Goal(kSemitoneDown) >= 0) return true;
    const std::ptrdiff_t fifth = chord.Goal(kFourthUp);
    if (fifth < 0) return false;
    return chord.Degree() == 0 || chord.IsPrepared() ||
           chord.ChordAt(fifth).mClass != TKeyChordClass_Dom;
}

// G G7 C in C: the V of the key, whatever follows. It may be delayed by vi, or by iii on the way.
bool NameDominantOfKey(const CChordInSong& chord, CChordName& name) {
    const bool hasForm =
        IsDom(chord) || chord.Is(TKeyChordClass_Triad) || chord.Is(TKeyChordClass_Open);
    if (chord.Degree() != 7 || !hasForm) return false;
    name.Be(TChordRelation_Dominant, THarmFunction_Dominant);
    const std::ptrdiff_t fifth = chord.Goal(kFourthUp);
    const int behind = chord.DegreeBehind();
    const bool isDelayed = behind == 4 && chord.DegreeOf(chord.Target()) != 0;
    if (fifth >= 0) {
        name.LeadTo(fifth);
    } else if (behind == 8 || behind == 9 || isDelayed) {
        name.LeadTo(chord.Next());
    }
    return true;
}

// Bb7 in C major, which comes to C by the back door, or to Em behind Fm.
bool NameBackdoor(const CChordInSong& chord, CChordName& name) {
    if (!IsDom(chord) || chord.Degree() != 10 || !chord.IsInMajor()) return false;
    const bool isBehindFour = chord.HasPrevious() && chord.DegreeOf(chord.Previous()) == 5;
    const int behind = chord.DegreeBehind();
    if (behind != 0 && !(behind == 4 && isBehindFour)) return false;
    name.Be(TChordRelation_Backdoor, THarmFunction_Dominant);
    name.LeadTo(chord.Next());
    return true;
}

// The later dominant on the same root that this one is but a first go at: D7 in D7 Am7 D7 G.
std::ptrdiff_t SameDominantLater(const CChordInSong& chord) {
    for (const std::ptrdiff_t later : {chord.Next(), chord.TargetOf(chord.Next())}) {
        if (later < 0 || chord.DegreeOf(later) != chord.Degree()) continue;
        const TKeyChordClass laterClass = chord.ChordAt(later).mClass;
        if (laterClass == TKeyChordClass_Dom || laterClass == TKeyChordClass_Triad) return later;
    }
    return kNoChord;
}

bool NameFirstGo(const CChordInSong& chord, CChordName& name) {
    if (!chord.HasNext() || !IsStrong(chord)) return false;
    const bool isDirect =
        chord.Goal(kFourthUp) == chord.Next() || chord.Goal(kSemitoneDown) == chord.Next();
    if (isDirect) return false;
    const std::ptrdiff_t later = SameDominantLater(chord);
    if (later < 0 || chord.KeyAt(later) != chord.Key()) return false;
    const CChordReading& reading = chord.ReadingAt(later);
    if (reading.mServes.IsTonic()) return false;
    const bool isSubstitute = reading.mRelation == TChordRelation_SubstituteDominant;
    name.Be(reading.mRelation, reading.mFunction);
    name.mReading.mServes = reading.mServes;
    WriteServingNumeral(chord, isSubstitute ? "subV" : "V", name.mReading);
    name.LeadTo(chord.TargetOf(later));
    return true;
}

// Db7 in C, unless Gb follows.
bool NameSubstituteOfKey(const CChordInSong& chord, CChordName& name) {
    if (!IsDom(chord) || chord.Degree() != 1) return false;
    if (chord.HasNext() && chord.Goal(kFourthUp) == chord.Next()) return false;
    name.mReading.mRelation = TChordRelation_SubstituteDominant;
    Apply(chord, "subV", 0, chord.Goal(kSemitoneDown), name);
    return true;
}

// A7 before Dm in C major is V7/ii. A seventh chord is one of whatever chord it leads to, a triad
// only of a degree of the key.
bool NameSecondaryDominant(const CChordInSong& chord, CChordName& name) {
    const std::ptrdiff_t fifth = chord.Goal(kFourthUp);
    if (fifth < 0 || !IsStrong(chord)) return false;
    const int target = chord.Degree() + kFourthUp;
    const bool isMinorFour = chord.Degree() == 5 && !chord.IsInMajor();
    if (!IsDom(chord) && (!chord.IsDegreeOfScale(target) || isMinorFour)) return false;
    name.mReading.mRelation = TChordRelation_Dominant;
    Apply(chord, "V", target, fifth, name);
    return true;
}

// Eb7 before Dm in C major is subV7/ii.
bool NameTritoneSubstitute(const CChordInSong& chord, CChordName& name) {
    const std::ptrdiff_t below = chord.Goal(kSemitoneDown);
    const int target = chord.Degree() + kSemitoneDown;
    if (!IsDom(chord) || below < 0 || !chord.IsDegreeOfScale(target)) return false;
    name.mReading.mRelation = TChordRelation_SubstituteDominant;
    Apply(chord, "subV", target, below, name);
    return true;
}

// A7 in C major even if no D follows.
bool NameUnresolvedDominant(const CChordInSong& chord, CChordName& name) {
    const CSemitones degrees = chord.IsInMajor() ? CSemitones{0, 2, 4, 9, 11} : CSemitones{0, 2, 3};
    if (!IsDom(chord) || chord.IsDiatonic() || !degrees.HasIntvl(chord.Degree())) return false;
    name.mReading.mRelation = TChordRelation_Dominant;
    Apply(chord, "V", chord.Degree() + kFourthUp, kNoChord, name);
    return true;
}

}  // namespace

bool NameChordAtRest(const CChordInSong& chord, CChordName& name) {
    const int degree = chord.Degree();
    if (!IsDom(chord) || !chord.Has(7) || !chord.IsInMajor()) return false;
    if (degree != 0 && degree != 5) return false;
    const CSongTraits& song = chord.Traits();
    const bool isOfBlues = song.mIsBlues && chord.IsAtHome() && !chord.IsPrepared();
    const bool mayRest = degree == 5 || song.mIsJazz;
    if (!isOfBlues && !(mayRest && !Resolves(chord))) return false;
    name.Be(TChordRelation_Blues, degree == 0 ? THarmFunction_Tonic : THarmFunction_Subdominant);
    const bool goesOn =
        chord.HasNext() &&
        (chord.DegreeBehind() == 0 || chord.ChordAt(chord.Next()).mClass == TKeyChordClass_Dim);
    if (degree == 5 && goesOn) name.LeadTo(chord.Next());
    return true;
}

bool NameDominant(const CChordInSong& chord, CChordName& name) {
    return NameDominantOfKey(chord, name) || NameBackdoor(chord, name) ||
           NameFirstGo(chord, name) || NameSubstituteOfKey(chord, name) ||
           NameSecondaryDominant(chord, name) || NameTritoneSubstitute(chord, name) ||
           NameUnresolvedDominant(chord, name);
}

}  // namespace brindle
