// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSemitones.h"

#include <cstdint>
#include <iosfwd>
#include <string_view>

namespace brindle {

/// The mode of a key signature.
enum TSignKeyType : std::int32_t {
    TSignKeyType_Undef = 0,
    TSignKeyType_Major = 1,
    TSignKeyType_Minor = 2,
};

/// The mask of the type: major 2741, minor 1453, anything else the undefined semitones.
[[nodiscard]] constexpr CSemitones SemitonesFromSignKeyType(TSignKeyType type) {
    if (type == TSignKeyType_Major) return kSemitonesMajor;
    if (type == TSignKeyType_Minor) return kSemitonesNaturalMinor;
    return CSemitones_Undef;
}

/// The type of the masks 2741 and 1453; undefined for any other.
[[nodiscard]] constexpr TSignKeyType SignKeyTypeFromSemitones(CSemitones semitones) {
    if (semitones == kSemitonesMajor) return TSignKeyType_Major;
    if (semitones == kSemitonesNaturalMinor) return TSignKeyType_Minor;
    return TSignKeyType_Undef;
}

/// "undef", "major" or "minor".
[[nodiscard]] std::string_view JSONWord(TSignKeyType type);

/// Writes "Undef", "Major" or "Minor"; any other value writes "unkown TSignKeyType".
std::ostream& operator<<(std::ostream& stream, TSignKeyType type);

}  // namespace brindle
