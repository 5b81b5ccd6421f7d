// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/ChordInSong.h"

#include <string_view>

namespace brindle {

/// How roots fall, in semitones upwards: of a dominant, and of its tritone substitute.
inline constexpr int kFourthUp = 5;
inline constexpr int kSemitoneDown = 11;

/// The name that a rule gives to a chord.
struct CChordName {
    CChordReading& mReading;
    /// The chord that it is led to.
    std::ptrdiff_t& mTarget;
    /// The rule tells the chord that it leads to.
    bool mIsLed = false;

    void Be(TChordRelation relation, THarmFunction function) {
        mReading.mRelation = relation;
        mReading.mFunction = function;
    }
    /// No chord changes nothing.
    void LeadTo(std::ptrdiff_t ix) {
        if (ix < 0) return;
        mTarget = ix;
        mIsLed = true;
    }
};

/// Writes the numeral of the chord's own degree, serving the tonic.
void WriteOwnNumeral(const CChordInSong& chord, CChordReading& reading);
/// Writes a prefix and the sign of the chord, and behind a slash what it serves.
void WriteServingNumeral(const CChordInSong& chord, std::string_view prefix,
                         CChordReading& reading);
/// Makes the chord one that is applied to the degree `target`, as the secondary dominant V7/ii is,
/// and leads it to the chord `goal` on it, if there is one.
void Apply(const CChordInSong& chord, std::string_view prefix, int target, std::ptrdiff_t goal,
           CChordName& name);

// The rules in the order in which they are tried. Each names the chord if it applies; the name
// begins as the chord's own degree with the function of that.
[[nodiscard]] bool NameChordAtRest(const CChordInSong& chord, CChordName& name);
[[nodiscard]] bool NamePredominant(const CChordInSong& chord, CChordName& name);
[[nodiscard]] bool NameDominant(const CChordInSong& chord, CChordName& name);
[[nodiscard]] bool NameDiminished(const CChordInSong& chord, CChordName& name);
[[nodiscard]] bool NameRelatedSecond(const CChordInSong& chord, CChordName& name);
/// Names what no other rule does.
void NameChordOfKey(const CChordInSong& chord, CChordName& name);

/// Names all chords of a song, in one go: a long song does not fit into the caches, and each way
/// through its readings waits for memory.
void NameHarmonies(const CSongToName& song);

}  // namespace brindle
