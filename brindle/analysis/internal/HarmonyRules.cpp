// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/HarmonyRules.h"

#include "brindle/analysis/internal/NumeralText.h"

#include <array>

namespace brindle {
namespace {

using enum THarmFunction;

constexpr std::array kFunctionInMajor{
    // I                   bII                        II                         bIII
    THarmFunction_Tonic, THarmFunction_Subdominant, THarmFunction_Subdominant, THarmFunction_Tonic,
    // III                 IV                         #IV                        V
    THarmFunction_Tonic, THarmFunction_Subdominant, THarmFunction_Subdominant,
    THarmFunction_Dominant,
    // bVI                      VI                    bVII                       VII
    THarmFunction_Subdominant, THarmFunction_Tonic, THarmFunction_Subdominant,
    THarmFunction_Dominant};

constexpr int kLoweredSeventh = 10;

// As in major, but the seventh of minor, on either step, is a dominant.
THarmFunction FunctionOf(int degree, bool isMajor) {
    if (!isMajor && degree == kLoweredSeventh) return THarmFunction_Dominant;
    return kFunctionInMajor[static_cast<std::size_t>(degree)];
}

constexpr CServedDegree kServedTonic{.mSemitones = 0, .mNumber = 1};

// Whether the degree that a chord is applied to is written in small letters: as the chord that
// stands there is, and as the key has it if that is a seventh chord or open.
bool IsSmallTarget(const CChordInSong& chord, int target, std::ptrdiff_t goal) {
    const bool isThere = goal >= 0 && chord.DegreeOf(goal) == target;
    if (isThere) {
        const TKeyChordClass goalClass = chord.ChordAt(goal).mClass;
        const bool hasOwnKind = goalClass != TKeyChordClass_Dom && goalClass != TKeyChordClass_Open;
        if (hasOwnKind) return IsSmallNumeral(goalClass);
    }
    return IsSmallDegree(target, chord.Key());
}

bool IsAtRest(const CChordReading& reading) {
    return reading.mFunction == THarmFunction_Tonic &&
           (reading.mRelation == TChordRelation_Tonic ||
            reading.mRelation == TChordRelation_Blues ||
            reading.mRelation == TChordRelation_ChromaticMediant);
}

bool IsSixOrFlatSix(int degree) {
    return degree == 8 || degree == 9;
}

bool IsDeceptive(const CChordInSong& chord, const CChordReading& reading) {
    if (reading.mRelation != TChordRelation_Dominant || !reading.mServes.IsTonic()) return false;
    if (!IsSixOrFlatSix(chord.DegreeBehind())) return false;
    const TKeyChordClass behind = chord.ChordAt(chord.Next()).mClass;
    return behind == TKeyChordClass_Triad || behind == TKeyChordClass_Maj7 ||
           behind == TKeyChordClass_Min || behind == TKeyChordClass_Min7;
}

std::ptrdiff_t Resolution(const CChordInSong& chord, const CChordName& name) {
    const CChordReading& reading = name.mReading;
    const std::ptrdiff_t target = name.mTarget;
    if (IsAtRest(reading)) return kNoChord;
    if (name.mIsLed || target < 0 || target == chord.Next()) return target;
    if (chord.KeyAt(target) != chord.Key()) return kNoChord;
    const bool isDominant = reading.mRelation == TChordRelation_Dominant;
    if (isDominant && (!reading.mServes.IsTonic() || chord.DegreeOf(target) != 0)) return kNoChord;
    return target;
}

}  // namespace

void WriteOwnNumeral(const CChordInSong& chord, CChordReading& reading) {
    reading.mServes = kServedTonic;
    reading.mNumeral.clear();
    AppendDegree(reading.mNumeral, NumeralDegreeOf(chord.Degree(), chord.Key()),
                 IsSmallNumeral(chord.Class()));
    reading.mNumeral += NumeralSignOf(chord.Chord().mSemitones);
}

void WriteServingNumeral(const CChordInSong& chord, std::string_view prefix,
                         CChordReading& reading) {
    reading.mNumeral = prefix;
    reading.mNumeral += NumeralSignOf(chord.Chord().mSemitones);
    reading.mNumeral += '/';
    const CServedDegree& served = reading.mServes;
    AppendDegree(reading.mNumeral, {served.mNumber, served.mAccidental}, served.mIsMinor);
}

void Apply(const CChordInSong& chord, std::string_view prefix, int target, std::ptrdiff_t goal,
           CChordName& name) {
    CChordReading& reading = name.mReading;
    name.LeadTo(goal);
    reading.mFunction = THarmFunction_Dominant;
    const int degree = FoldIntoOctave(target);
    reading.mServes = kServedTonic;
    if (degree == 0 && prefix != "subV") {
        reading.mNumeral = prefix;
        reading.mNumeral += NumeralSignOf(chord.Chord().mSemitones);
        return;
    }
    if (degree != 0) {
        const CNumeralDegree& written = NumeralDegreeOf(degree, chord.Key());
        reading.mServes = {
            static_cast<std::int8_t>(degree), static_cast<std::int8_t>(written.mNumber),
            static_cast<std::int8_t>(written.mAccidental), IsSmallTarget(chord, degree, goal)};
    }
    WriteServingNumeral(chord, prefix, reading);
}

namespace {

void NameChord(const CChordInSong& chord, CChordName& name) {
    name.Be(TChordRelation_None, FunctionOf(chord.Degree(), chord.IsInMajor()));
    WriteOwnNumeral(chord, name.mReading);
    const bool isNamed = NameChordAtRest(chord, name) || NamePredominant(chord, name) ||
                         NameDominant(chord, name) || NameDiminished(chord, name) ||
                         NameRelatedSecond(chord, name);
    if (!isNamed) NameChordOfKey(chord, name);
}

}  // namespace

// A rule reads the targets of later chords as the rules have left them; the resolutions leave some
// of them out.
void NameHarmonies(const CSongToName& song) {
    for (std::size_t i = song.mChords.size(); i-- > 0;) {
        const CChordInSong chord(song, i);
        CChordName name{song.ReadingOf(i), song.mTargets[i]};
        name.mReading.mKey = song.mSpeller.SignKeyOf(chord.Key());
        name.mReading.mUnder = song.PlaceOf(chord.Target());
        NameChord(chord, name);
        name.mReading.mDeceptive = IsDeceptive(chord, name.mReading);
        name.mReading.mResolvesTo = song.PlaceOf(Resolution(chord, name));
    }
}

}  // namespace brindle
