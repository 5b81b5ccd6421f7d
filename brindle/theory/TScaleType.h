// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <iosfwd>
#include <string_view>

namespace brindle {

/// The named scales. A scale of type `st_custom` holds a row of its own.
enum TScaleType : std::int32_t {
    st_Undef = 0,
    st_maj = 1,
    st_min = 2,
    st_chrom = 3,
    st_majmin = 4,
    st_majaddb7 = 5,
    st_min_harm = 6,
    st_min_melo = 7,
    st_maj_pent = 8,
    st_min_pent = 9,
    st_maj_blues = 10,
    st_min_blues = 11,
    st_lydian = 12,
    st_mixolydian = 13,
    st_dorian = 14,
    st_phrygian = 15,
    st_locrian = 16,
    st_hm5 = 17,
    st_japanese = 18,
    st_southeast_asian = 19,
    st_custom = 20,
    DiminishedHalfWhole = 21,
    DiminishedWholeHalf = 22,
    BebopMajor = 23,
    BebopDominant = 24,
    BebopMelodicMinor = 25,
    BebopHarmonicMinor = 26,
    MixolydianSharp11 = 27,
    LocrianMaj2 = 28,
    Altered = 29,
    DoubleHarmonic = 30,
    st_Count = 31,
};

/// Whether the scale is one of the seven modes of the major scale.
[[nodiscard]] constexpr bool IsScaleTypeModal(TScaleType type) {
    return type == st_maj || type == st_min || (type >= st_lydian && type <= st_locrian);
}

/// The word of the type in JSON text: "maj", "dori", "TScaleType::Altered". A value outside the
/// enumeration gives "undef".
[[nodiscard]] std::string_view ToJSONString(TScaleType type);
/// The type of an exact JSON word of the types 1 to 20; `st_Undef` for any other text, so the
/// later types do not come back by name.
[[nodiscard]] TScaleType ScaleTypeFromJSONString(std::string_view word);

/// Step to the next or the previous number, without end.
TScaleType& operator++(TScaleType& type);
/// The same; gives the type before it.
TScaleType operator++(TScaleType& type, int);
/// One step back.
TScaleType& operator--(TScaleType& type);
/// The same; gives the type before it.
TScaleType operator--(TScaleType& type, int);

/// Writes the enumerator, as "st_dorian"; a value outside the enumeration writes "undef".
std::ostream& operator<<(std::ostream& stream, TScaleType type);

}  // namespace brindle
