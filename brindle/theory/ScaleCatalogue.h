// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSemitones.h"
#include "brindle/theory/TEnh.h"
#include "brindle/theory/TScaleType.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <string_view>

namespace brindle {

/// The colour of a scale.
enum TScaleMode : std::int32_t {
    TScaleMode_Major = 0,   ///< counts as a major scale
    TScaleMode_Minor = 1,   ///< counts as a minor scale
    TScaleMode_None = 2,    ///< counts as neither
    TScaleMode_Custom = 3,  ///< of the type `st_custom` or none
};

/// A scale without a root: which steps it has and how it is called.
struct CScaleRow {
    /// The key of the row.
    TScaleType mType = st_Undef;
    std::string_view mName;  ///< in English, "Natural Minor"
    /// Number of degrees. May exceed 12 in a custom row; then only the first 12 have an offset.
    int mDegreesPerOctave = 0;
    /// Semitones above the root of degree 0, 1, ...; 0 beyond the last degree.
    std::array<int, 12> mDegreeToRootOffsetIntvl{};
    /// By degree from 0, how the step is written against the plain degree of major or minor: a
    /// sharp for the seventh of harmonic minor. Natural elsewhere. Carried for hosts; scales are
    /// spelled by CScaleHeavy::CalcEnh, which does not read it.
    std::array<TEnh, 12> mDegreeEnh{};
    TScaleMode mMode = TScaleMode_Custom;  ///< of the type; custom for the empty row

    /// The degrees that have an offset: the degree count, but 0 to 12.
    [[nodiscard]] constexpr int StoredDegreeCount() const {
        return std::clamp(mDegreesPerOctave, 0, 12);
    }
    /// Semitones above the root of a degree; 0 when the row does not hold it.
    [[nodiscard]] constexpr int OffsetIntvl(int degree) const {
        if (degree < 0 || degree >= StoredDegreeCount()) return 0;
        return mDegreeToRootOffsetIntvl[static_cast<std::size_t>(degree)];
    }
    /// The offsets as a mask, each reduced into the octave.
    [[nodiscard]] constexpr CSemitones Semitones() const {
        CSemitones semitones;
        for (int degree = 0; degree < StoredDegreeCount(); ++degree) {
            semitones.AddIntvl(OffsetIntvl(degree));
        }
        return semitones;
    }
};

/// One spelling in the table of scales that is not natural.
/// Where the spelling goes in CScaleRow::mDegreeEnh.
struct CStepSpelling {
    std::size_t mStep;  ///< the degree, from 0
    TEnh mEnh;          ///< what stands there
};

/// Not a constant expression: a row of the table that arrives here does not compile.
void RowOfScaleTableIsWrong();

/// A row of the table of scales. The degree count and the mask must be those of the offsets.
consteval CScaleRow MakeScaleRow(TScaleType type, std::string_view name, int degrees,
                                 TScaleMode mode, std::initializer_list<int> offsets,
                                 std::uint64_t mask,
                                 std::initializer_list<CStepSpelling> spellings) {
    CScaleRow row{type, name, degrees, {}, {}, mode};
    std::copy(offsets.begin(), offsets.end(), row.mDegreeToRootOffsetIntvl.begin());
    row.mDegreeEnh.fill(TEnh_n);
    for (const CStepSpelling& spelling : spellings) row.mDegreeEnh[spelling.mStep] = spelling.mEnh;

    const bool ascending = std::is_sorted(offsets.begin(), offsets.end());
    if (!ascending || row.Semitones() != CSemitones(mask) || CSemitones(mask).size() != degrees) {
        RowOfScaleTableIsWrong();
    }
    return row;
}

/// All named scales; the last row is the empty one of the undefined scale. The index of a row is
/// its place here and not its type. Major + b7 and Bebop Dominant have the same tones.
// clang-format off
inline constexpr std::array<CScaleRow, 30> kScaleCatalogue{{
    //            type                 name                  degrees  mode              offsets                                  mask  spellings
    MakeScaleRow(st_maj,              "Major",                     7, TScaleMode_Major, {0, 2, 4, 5, 7, 9, 11},                  2741, {}),
    MakeScaleRow(st_min,              "Natural Minor",             7, TScaleMode_Minor, {0, 2, 3, 5, 7, 8, 10},                  1453, {}),
    MakeScaleRow(st_chrom,            "Chromatic",                12, TScaleMode_None,  {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11},  4095, {}),
    MakeScaleRow(st_majmin,           "Major/Minor",               9, TScaleMode_None,  {0, 2, 3, 4, 5, 7, 9, 10, 11},           3773, {{2, TEnh_b}, {7, TEnh_b}}),
    MakeScaleRow(st_majaddb7,         "Major + b7",                8, TScaleMode_Major, {0, 2, 4, 5, 7, 9, 10, 11},              3765, {}),
    MakeScaleRow(st_min_harm,         "Harmonic Minor",            7, TScaleMode_Minor, {0, 2, 3, 5, 7, 8, 11},                  2477, {{6, TEnh_s}}),
    MakeScaleRow(st_min_melo,         "Melodic Minor",             7, TScaleMode_Minor, {0, 2, 3, 5, 7, 9, 11},                  2733, {{5, TEnh_s}, {6, TEnh_s}}),
    MakeScaleRow(st_maj_pent,         "Major Pentatonic",          5, TScaleMode_Major, {0, 2, 4, 7, 9},                          661, {}),
    MakeScaleRow(st_min_pent,         "Minor Pentatonic",          5, TScaleMode_Minor, {0, 3, 5, 7, 10},                        1193, {}),
    MakeScaleRow(st_maj_blues,        "Major Blues",               6, TScaleMode_Major, {0, 2, 3, 4, 7, 9},                       669, {{2, TEnh_b}}),
    MakeScaleRow(st_min_blues,        "Minor Blues",               6, TScaleMode_Minor, {0, 3, 5, 6, 7, 10},                     1257, {{3, TEnh_b}}),
    MakeScaleRow(st_lydian,           "Lydian",                    7, TScaleMode_Major, {0, 2, 4, 6, 7, 9, 11},                  2773, {{3, TEnh_s}}),
    MakeScaleRow(st_mixolydian,       "Mixolydian",                7, TScaleMode_Major, {0, 2, 4, 5, 7, 9, 10},                  1717, {{6, TEnh_b}}),
    MakeScaleRow(st_dorian,           "Dorian",                    7, TScaleMode_Minor, {0, 2, 3, 5, 7, 9, 10},                  1709, {{5, TEnh_s}}),
    MakeScaleRow(st_phrygian,         "Phrygian",                  7, TScaleMode_Minor, {0, 1, 3, 5, 7, 8, 10},                  1451, {{1, TEnh_b}}),
    MakeScaleRow(st_locrian,          "Locrian",                   7, TScaleMode_Minor, {0, 1, 3, 5, 6, 8, 10},                  1387, {{1, TEnh_b}, {4, TEnh_b}}),
    MakeScaleRow(st_hm5,              "HM5",                       7, TScaleMode_Major, {0, 1, 4, 5, 7, 8, 10},                  1459, {{1, TEnh_b}, {5, TEnh_b}, {6, TEnh_b}}),
    MakeScaleRow(st_japanese,         "Japanese",                  5, TScaleMode_None,  {0, 1, 5, 7, 8},                          419, {{1, TEnh_b}, {4, TEnh_b}}),
    MakeScaleRow(st_southeast_asian,  "South-East Asian",          5, TScaleMode_None,  {0, 1, 3, 7, 8},                          395, {{1, TEnh_b}, {2, TEnh_b}, {4, TEnh_b}}),
    MakeScaleRow(MixolydianSharp11,   "Mixolydian #11",            7, TScaleMode_Major, {0, 2, 4, 6, 7, 9, 10},                  1749, {{3, TEnh_s}, {6, TEnh_b}}),
    MakeScaleRow(DiminishedHalfWhole, "Half-Whole Diminished",     8, TScaleMode_Major, {0, 1, 3, 4, 6, 7, 9, 10},               1755, {{1, TEnh_b}, {2, TEnh_s}, {4, TEnh_s}, {7, TEnh_b}}),
    MakeScaleRow(Altered,             "Altered",                   7, TScaleMode_Major, {0, 1, 3, 4, 6, 8, 10},                  1371, {{1, TEnh_b}, {2, TEnh_s}, {4, TEnh_s}, {5, TEnh_b}, {6, TEnh_b}}),
    MakeScaleRow(BebopMajor,          "Bebop Major",               8, TScaleMode_Major, {0, 2, 4, 5, 7, 8, 9, 11},               2997, {{5, TEnh_s}}),
    MakeScaleRow(BebopDominant,       "Bebop Dominant",            8, TScaleMode_Major, {0, 2, 4, 5, 7, 9, 10, 11},              3765, {{6, TEnh_b}}),
    MakeScaleRow(DiminishedWholeHalf, "Whole-Half Diminished",     8, TScaleMode_Minor, {0, 2, 3, 5, 6, 8, 9, 11},               2925, {{4, TEnh_b}, {6, TEnh_s}, {7, TEnh_s}}),
    MakeScaleRow(LocrianMaj2,         "Locrian #2",                7, TScaleMode_Minor, {0, 2, 3, 5, 6, 8, 10},                  1389, {{4, TEnh_b}}),
    MakeScaleRow(BebopMelodicMinor,   "Bebop Melodic Minor",       8, TScaleMode_Minor, {0, 2, 3, 5, 7, 8, 9, 11},               2989, {{6, TEnh_s}, {7, TEnh_s}}),
    MakeScaleRow(BebopHarmonicMinor,  "Bebop Harmonic Minor",      8, TScaleMode_Minor, {0, 2, 3, 5, 7, 8, 10, 11},              3501, {{7, TEnh_s}}),
    MakeScaleRow(DoubleHarmonic,      "Double Harmonic/Byzantine", 7, TScaleMode_None,  {0, 1, 4, 5, 7, 8, 11},                  2483, {{1, TEnh_b}, {5, TEnh_b}}),
    CScaleRow{},
}};
// clang-format on

/// What a custom scale starts from.
inline constexpr CScaleRow kCustomScaleRow = MakeScaleRow(
    st_custom, "Custom", 12, TScaleMode_Custom, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11}, 4095, {});

}  // namespace brindle
