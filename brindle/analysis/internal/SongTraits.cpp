// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/SongTraits.h"

#include <algorithm>

namespace brindle {
namespace {

constexpr std::size_t kLeastChordsOfVamp = 4;

bool IsPlainMinor(const CKeyChord& chord) {
    return chord.mClass == TKeyChordClass_Min || chord.mClass == TKeyChordClass_Min7;
}

bool IsMajorOrOpen(const CKeyChord& chord) {
    return chord.mClass == TKeyChordClass_Triad || chord.mClass == TKeyChordClass_Maj7 ||
           chord.mClass == TKeyChordClass_Dom || chord.mClass == TKeyChordClass_Open;
}

// I7 and IV7, and no more of a plain I than of I7.
bool IsBlues(std::span<const CKeyChord> chords, int home) {
    if (IsMinorKey(home)) return false;
    double seventhOnOne = 0.0;
    double plainOnOne = 0.0;
    double seventhOnFour = 0.0;
    for (const CKeyChord& chord : chords) {
        const int degree = DegreeInKey(chord.mRoot, home);
        const bool isDom = chord.mClass == TKeyChordClass_Dom;
        const bool isPlain =
            chord.mClass == TKeyChordClass_Triad || chord.mClass == TKeyChordClass_Maj7;
        if (degree == 0 && isDom) seventhOnOne += chord.mBeats;
        if (degree == 0 && isPlain) plainOnOne += chord.mBeats;
        if (degree == 5 && isDom) seventhOnFour += chord.mBeats;
    }
    return seventhOnFour > 0.0 && seventhOnOne > 0.0 && seventhOnOne >= plainOnOne;
}

bool IsJazzChord(const CKeyChord& chord) {
    return chord.mClass == TKeyChordClass_Min7 || chord.mClass == TKeyChordClass_HDim ||
           (chord.mClass == TKeyChordClass_Maj7 && chord.Has(11));
}

}  // namespace

int KeyOfVamp(std::span<const CKeyChord> chords) {
    if (chords.size() < kLeastChordsOfVamp) return -1;
    const int tonic = chords.front().mRoot;
    const int fourth = FoldIntoOctave(tonic + 5);
    const auto fits = [&](const CKeyChord& chord) {
        return (chord.mRoot == tonic && IsPlainMinor(chord)) ||
               (chord.mRoot == fourth && IsMajorOrOpen(chord));
    };
    const auto isFourth = [&](const CKeyChord& chord) { return chord.mRoot == fourth; };
    const bool isVamp = fits(chords.front()) && std::all_of(chords.begin(), chords.end(), fits) &&
                        std::any_of(chords.begin(), chords.end(), isFourth);
    return isVamp ? tonic + 12 : -1;
}

CSongTraits SongTraitsOf(std::span<const CKeyChord> chords, int home) {
    CSongTraits traits;
    traits.mHome = home;
    traits.mIsVamp = KeyOfVamp(chords) == home;
    traits.mIsBlues = IsBlues(chords, home);
    const auto jazzChords = std::count_if(chords.begin(), chords.end(), IsJazzChord);
    traits.mIsJazz = traits.mIsBlues || static_cast<std::size_t>(jazzChords) * 4 >= chords.size();
    return traits;
}

}  // namespace brindle
