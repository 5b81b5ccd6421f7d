// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSemitones.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace brindle {

class CHarmAnlsChords;

/// What a chord is for the ear that looks for a key.
enum TKeyChordClass : std::uint8_t {
    TKeyChordClass_Triad,  ///< C
    TKeyChordClass_Maj7,   ///< Cmaj7, C6
    TKeyChordClass_Dom,    ///< C7, C+
    TKeyChordClass_Min,    ///< Cm, and the tonic chords Cm6 and Cm(maj7)
    TKeyChordClass_Min7,   ///< Cm7
    TKeyChordClass_HDim,   ///< Cm7b5
    TKeyChordClass_Dim,    ///< Cdim, Cdim7
    TKeyChordClass_Open,   ///< without a third: Csus4, C5
};
inline constexpr std::size_t kKeyChordClassCount = 8;

[[nodiscard]] constexpr TKeyChordClass KeyChordClassOf(CSemitones semitones) {
    const auto has = [&](int intvl) { return semitones.HasIntvl(intvl); };
    if (has(4)) {
        if (has(10)) return TKeyChordClass_Dom;
        if (has(11) || has(9)) return TKeyChordClass_Maj7;
        return has(8) && !has(7) ? TKeyChordClass_Dom : TKeyChordClass_Triad;
    }
    if (has(3)) {
        if (has(6) && !has(7)) return has(10) ? TKeyChordClass_HDim : TKeyChordClass_Dim;
        if (has(11) || has(9)) return TKeyChordClass_Min;
        return has(10) ? TKeyChordClass_Min7 : TKeyChordClass_Min;
    }
    return TKeyChordClass_Open;
}

/// A chord of a song as long as it sounds, whatever the number of times that it is written.
struct CKeyChord {
    TKeyChordClass mClass;
    std::int8_t mRoot;  ///< pitch class, 0 to 11
    std::int8_t mBass;  ///< pitch class, that of the root without a bass
    bool mHasBass;
    /// Its place in the list of chords. Small, since long songs wait for memory; a list with more
    /// places would take 160 GB.
    std::uint32_t mBegin;
    CSemitones mSemitones;
    double mBeats;

    [[nodiscard]] constexpr bool Has(int intvl) const { return mSemitones.HasIntvl(intvl); }
};

/// Whether the two are one kind of chord on one root.
[[nodiscard]] constexpr bool IsSameKind(const CKeyChord& a, const CKeyChord& b) {
    return a.mClass == b.mClass && a.mRoot == b.mRoot;
}

/// The chords of a song. One that is the same as the one before makes that one longer, and so does
/// an undefined one; undefined chords before the first chord are left out. C and C/C are two
/// chords.
///
/// A length that is negative or no length at all is 0. When no chord has a length, all are equally
/// long.
[[nodiscard]] std::vector<CKeyChord> KeyChordsOf(const CHarmAnlsChords& chords);

}  // namespace brindle
