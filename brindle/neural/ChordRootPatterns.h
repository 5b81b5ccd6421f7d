// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSemitones.h"

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

namespace brindle {

/// A chord shape that the net learns to hear the root of.
struct CChordShape {
    std::string_view mName;  ///< "minor", in English
    CSemitones mTones;       ///< above the root, folded into one octave
    bool mIsOfCatalogue;     ///< of the usual shapes, not one of the further ones
    bool mIsSecondReading;   ///< loses to another shape with the same notes if no root is lowest
};

/// All shapes: the usual ones in the order of the chord catalogue, then the further ones.
[[nodiscard]] std::span<const CChordShape> ChordShapes();

/// Which tone of a chord is left out.
enum TOmission : std::uint8_t {
    TOmission_None = 0,   ///< all tones sound
    TOmission_Fifth = 1,  ///< the perfect fifth
    TOmission_Third = 2,  ///< the third, of whatever size
    TOmission_Root = 3,   ///< the root
};

/// What the net hears of a chord, and where the root is.
struct CChordRootPattern {
    std::uint32_t mInputs = 0;  ///< bit i: a note i semitones above the lowest, modulo 24
    int mRootIntvl = 0;         ///< 0 to 11 semitones from the lowest note up to the root
    std::size_t mShape = 0;     ///< index in ChordShapes() of the shape that it counts as
    TOmission mOmission = TOmission_None;  ///< what is left out of the shape
    bool mIsOfCatalogue = false;  ///< whether it is a voicing of a usual shape, nothing left out

    friend constexpr bool operator==(const CChordRootPattern&, const CChordRootPattern&) = default;
};

/// Inputs of the net: two octaves above the lowest note.
inline constexpr int kChordRootInputCount = 24;

/// Every input that a voicing of these shapes can give, once each, ordered by `mInputs`: each tone
/// as the lowest note, every other tone in the first octave, the second or both, with and without
/// the octave above the lowest note; the same with the fifth, the third or the root left out of
/// chords of four and more notes. Where several chords have the same notes, one root counts.
[[nodiscard]] std::vector<CChordRootPattern> ChordRootPatterns();

}  // namespace brindle
