// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <iosfwd>
#include <string_view>

namespace brindle {

/// The named scales. A scale of type `st_custom` holds a row of its own.
enum TScaleType : std::int32_t {
    st_Undef = 0,              ///< no scale
    st_maj = 1,                ///< major, ionian
    st_min = 2,                ///< natural minor, aeolian
    st_chrom = 3,              ///< all twelve keys
    st_majmin = 4,             ///< major and natural minor together
    st_majaddb7 = 5,           ///< major with both sevenths
    st_min_harm = 6,           ///< harmonic minor
    st_min_melo = 7,           ///< melodic minor, as it goes up
    st_maj_pent = 8,           ///< major without fourth and seventh
    st_min_pent = 9,           ///< minor without second and sixth
    st_maj_blues = 10,         ///< major pentatonic with a minor third
    st_min_blues = 11,         ///< minor pentatonic with a flat fifth
    st_lydian = 12,            ///< major with a raised fourth
    st_mixolydian = 13,        ///< major with a minor seventh
    st_dorian = 14,            ///< minor with a major sixth
    st_phrygian = 15,          ///< minor with a minor second
    st_locrian = 16,           ///< minor with a minor second and a flat fifth
    st_hm5 = 17,               ///< harmonic minor from its fifth, phrygian dominant
    st_japanese = 18,          ///< five tones of Japan, miyako-bushi
    st_southeast_asian = 19,   ///< five tones of South-East Asia
    st_custom = 20,            ///< steps of its own
    DiminishedHalfWhole = 21,  ///< half and whole tones in turn
    DiminishedWholeHalf = 22,  ///< whole and half tones in turn
    BebopMajor = 23,           ///< major with a minor sixth between
    BebopDominant = 24,        ///< mixolydian with a major seventh between
    BebopMelodicMinor = 25,    ///< melodic minor with a minor sixth between
    BebopHarmonicMinor = 26,   ///< harmonic minor with a minor seventh between
    MixolydianSharp11 = 27,    ///< melodic minor from its fourth
    LocrianMaj2 = 28,          ///< melodic minor from its sixth
    Altered = 29,              ///< melodic minor from its seventh
    DoubleHarmonic = 30,       ///< major with minor second and sixth, Byzantine
    st_Count = 31,             ///< behind the last type
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
