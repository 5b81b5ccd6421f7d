// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CHarmCenterLite.h"

#include <cstdint>

namespace brindle {

/// The harmonic centers that the analysis knows, the twelve major and the twelve natural minor
/// keys, as bits of one number, so that a chord is tried on all of them at once.
///
/// Bit k is the major center on pitch class k, bit 12 + k the minor one. Bit 24 stands for a center
/// without a scale.
namespace ModalCenters {

/// Pitch classes as a set: bit n is that of number n.
using TPitchClasses = std::uint32_t;
/// Centers as a set: bit n is the center of that place.
using TCenters = std::uint32_t;

/// The place of the minor center on pitch class 0.
inline constexpr int kMinorOffset = 12;
/// How many keys there are; also the first place that is none.
inline constexpr int kTonalityCount = 24;
/// The place of a center without a scale.
inline constexpr int kNoScale = 24;
/// How many places there are.
inline constexpr int kCount = 25;

/// The set of the intervals above a root as pitch classes; a root outside 0 to 11 is reduced.
[[nodiscard]] TPitchClasses PitchClassesAbove(int rootKeyNr, CSemitones semitones);
/// The pitch classes that sound: the tones, and the bass, or else the root. None for an undefined
/// chord.
[[nodiscard]] TPitchClasses PitchClassesOf(const CChordLite& chord);

/// The bit number of a center on a pitch class from 0 to 11: major, natural minor, or no scale.
[[nodiscard]] int PlaceOf(const CHarmCenterLite& center);

/// The centers whose scale holds all the pitch classes.
[[nodiscard]] TCenters CentersHolding(TPitchClasses pitchClasses);
/// The centers that tolerate the chord, as ScaleLite::ChordIsCompatibleWithScale tells.
[[nodiscard]] TCenters CentersTolerating(const CChordLite& chord);
/// The centers that the chord belongs to as to a key, as CChordHeavy::IsInSignKeyRegardlessOfEnh
/// tells: its tones are in the scale, only the dominant of a minor key needs its major third
/// instead. Bit 24 has no meaning here. None for an undefined chord.
[[nodiscard]] TCenters CentersOwning(const CChordLite& chord);

}  // namespace ModalCenters
}  // namespace brindle
