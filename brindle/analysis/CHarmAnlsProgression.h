// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CSemitonesMatch.h"
#include "brindle/theory/CHarmCenterLite.h"
#include "brindle/theory/TSignKeyType.h"

#include <cstddef>
#include <cstdint>
#include <iosfwd>
#include <vector>

namespace brindle {

/// Whether a progression is looked for from a chord on or up to a chord.
enum TMatchDirection : std::int32_t {
    TMatchDirection_Forward = 0,   ///< from the chord on
    TMatchDirection_Backward = 1,  ///< up to the chord
};

/// One chord of a progression: where it stands above the tonic, and its quality.
struct CHarmAnlsProgressionEl {
    /// Semitones from the tonic up to the chord's root. Only the steps between elements are
    /// compared, reduced into the octave.
    std::int32_t mRootDistToHarmCenter = 0;
    /// The same for the bass. No match reads it.
    std::int32_t mBassDistToHarmCenter = 0;
    CSemitonesMatch mSemitonesMatch;  ///< the quality of the chord

    /// Writes an object with all fields.
    void AppendJSONString(std::ostream& stream) const;

    friend bool operator==(const CHarmAnlsProgressionEl&, const CHarmAnlsProgressionEl&) = default;
};

/// A progression that tells where the tonic is: "a major chord seven semitones above the tonic,
/// then a major chord on the tonic" is G C in C major. Chords match it when their qualities fit and
/// their roots move as its roots do; bass and rhythm do not matter.
class CHarmAnlsProgression : public std::vector<CHarmAnlsProgressionEl> {
public:
    /// A place in the list of chords.
    using chord_iterator = CHarmAnlsChords::const_iterator;

    /// Larger is better.
    std::int32_t mPriority = 0;
    /// The mode of the center that the progression tells.
    TSignKeyType mSignKeyType = TSignKeyType_Undef;

    CHarmAnlsProgression() = default;
    /// The elements with the priority and the mode of the center that they tell.
    CHarmAnlsProgression(std::vector<CHarmAnlsProgressionEl> elements, std::int32_t priority,
                         TSignKeyType signKeyType);

    /// Whether the chords from `it` on match. Undefined chords at the end of the list do not count.
    [[nodiscard]] bool MatchesHarmChordsFrom(const CHarmAnlsChords& chords,
                                             chord_iterator it) const;
    /// Whether the chords up to and with `it` match.
    [[nodiscard]] bool MatchesHarmChordsBackwardsFrom(const CHarmAnlsChords& chords,
                                                      chord_iterator it) const;
    /// Same length and priority.
    [[nodiscard]] bool MatchesAsGoodAs(const CHarmAnlsProgression& other) const;

    /// The center from the last element (forward) or the first one (backward), as below.
    [[nodiscard]] CHarmCenterLite HarmCenterFromProgressionAndChord(
        chord_iterator it, const CHarmAnlsChords& chords, TMatchDirection direction) const;
    /// The center that makes element n fit the chord n places behind `it`, spelled like the tonic
    /// chord if it sounds. Undefined if there is no such element or chord.
    [[nodiscard]] CHarmCenterLite HarmCenterCalculatedFromFoundProgressionNthChord(
        std::size_t n, chord_iterator it, const CHarmAnlsChords& chords) const;
    /// The same of the last element.
    [[nodiscard]] CHarmCenterLite HarmCenterCalculatedFromFoundProgressionLastChord(
        chord_iterator it, const CHarmAnlsChords& chords) const;
    /// The same of the first element, the chord at `it`.
    [[nodiscard]] CHarmCenterLite HarmCenterCalculatedFromFoundProgressionFirstChord(
        chord_iterator it, const CHarmAnlsChords& chords) const;
    /// Where a match at `it` begins; the end of the chords for an unknown direction.
    [[nodiscard]] chord_iterator HarmCenterChordsBegin(chord_iterator it,
                                                       const CHarmAnlsChords& chords,
                                                       TMatchDirection direction) const;
    /// Spells the root of `center`, whose key is known, from the chords of the match at `it`.
    /// `chord` is the one that the center was counted from, `rootDist` its distance to the tonic.
    void _SetEnhForHarmCenter(CHarmCenterLite& center, chord_iterator it,
                              const CHarmAnlsChords& chords, std::int32_t rootDist,
                              chord_iterator chord) const;

    /// Writes a list of the elements, without the priority and the mode. No strict JSON: it ends
    /// with a comma.
    void AppendJSONString(std::ostream& stream) const;

    friend bool operator==(const CHarmAnlsProgression& a, const CHarmAnlsProgression& b) = default;
};

/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsProgressionEl& element);
/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CHarmAnlsProgression& progression);

}  // namespace brindle
