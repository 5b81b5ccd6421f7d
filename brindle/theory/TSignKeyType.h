// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSemitones.h"
#include "brindle/theory/TScaleType.h"

#include <cstdint>
#include <iosfwd>
#include <string>
#include <string_view>

namespace brindle {

/// The mode of a key signature.
enum TSignKeyType : std::int32_t {
    TSignKeyType_Undef = 0,  ///< no key signature is known
    TSignKeyType_Major = 1,  ///< major
    TSignKeyType_Minor = 2,  ///< natural minor
};

/// The mode of a key signature that is always one of the two.
enum TSignKeyTypeNoUndef : std::int32_t {
    TSignKeyTypeNoUndef_Major = 0,  ///< major
    TSignKeyTypeNoUndef_Minor = 1,  ///< natural minor
};

/// The same mode in the other enumeration; undefined for a value outside 0 and 1.
[[nodiscard]] constexpr TSignKeyType FromSignKeyTypeNoUndef(TSignKeyTypeNoUndef type) {
    if (type == TSignKeyTypeNoUndef_Major) return TSignKeyType_Major;
    if (type == TSignKeyTypeNoUndef_Minor) return TSignKeyType_Minor;
    return TSignKeyType_Undef;
}

/// Minor for minor, major for everything else.
[[nodiscard]] constexpr TSignKeyTypeNoUndef FromSignKeyType(TSignKeyType type) {
    return type == TSignKeyType_Minor ? TSignKeyTypeNoUndef_Minor : TSignKeyTypeNoUndef_Major;
}
/// The same, under the name that tells it.
[[nodiscard]] constexpr TSignKeyTypeNoUndef FromSignKeyTypeInCaseOfUndefReturnMajor(
    TSignKeyType type) {
    return FromSignKeyType(type);
}

/// The mask of the type: major 2741, minor 1453, anything else the undefined semitones.
[[nodiscard]] constexpr CSemitones SemitonesFromSignKeyType(TSignKeyType type) {
    if (type == TSignKeyType_Major) return kSemitonesMajor;
    if (type == TSignKeyType_Minor) return kSemitonesNaturalMinor;
    return CSemitones_Undef;
}

/// The mask of the type: minor 1453, otherwise major 2741.
[[nodiscard]] constexpr CSemitones SemitonesFromSignKeyTypeNoUndef(TSignKeyTypeNoUndef type) {
    return type == TSignKeyTypeNoUndef_Minor ? kSemitonesNaturalMinor : kSemitonesMajor;
}

/// The type of the masks 2741 and 1453; undefined for any other.
[[nodiscard]] constexpr TSignKeyType SignKeyTypeFromSemitones(CSemitones semitones) {
    if (semitones == kSemitonesMajor) return TSignKeyType_Major;
    if (semitones == kSemitonesNaturalMinor) return TSignKeyType_Minor;
    return TSignKeyType_Undef;
}

/// Whether a scale is written under a major or a minor key signature; major for the types that
/// are neither.
[[nodiscard]] TSignKeyType SignKeyTypeFromScaleType(TScaleType type);
/// The same in the other enumeration.
[[nodiscard]] TSignKeyTypeNoUndef SignKeyTypeNoUndefFromScaleType(TScaleType type);

/// The type of the exact word "major" or "minor"; undefined for any other text.
[[nodiscard]] TSignKeyType SignKeyTypeFromString(std::string_view word);
/// The same; major for any other text.
[[nodiscard]] TSignKeyTypeNoUndef SignKeyTypeNoUndefFromString(std::string_view word);

/// "undef", "major" or "minor".
[[nodiscard]] std::string_view JSONWord(TSignKeyType type);
/// "TSignKeyType::Major" and so on.
[[nodiscard]] std::string StringForInitializerList(TSignKeyType type);

/// Writes "Undef", "Major" or "Minor"; any other value writes "unkown TSignKeyType".
std::ostream& operator<<(std::ostream& stream, TSignKeyType type);
/// Writes "Major" or "Minor"; any other value writes "unkown TSignKeyTypeNoUndef".
std::ostream& operator<<(std::ostream& stream, TSignKeyTypeNoUndef type);

}  // namespace brindle
