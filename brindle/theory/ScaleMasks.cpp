// SPDX-License-Identifier: MIT
#include "brindle/theory/ScaleMasks.h"

#include <algorithm>
#include <array>
#include <cstddef>

namespace brindle {

namespace {

struct CScaleMask {
    TScaleType mType;
    CSemitones mSemitones;
};

// The mask of each scale type, 1 to 30.
// clang-format off
constexpr auto kScaleMasks = std::to_array<CScaleMask>({
    {st_maj,              CSemitones(2741)},  // 0 2 4 5 7 9 11
    {st_min,              CSemitones(1453)},  // 0 2 3 5 7 8 10
    {st_chrom,            CSemitones(4095)},  // all twelve
    {st_majmin,           CSemitones(3773)},  // 0 2 3 4 5 7 9 10 11
    {st_majaddb7,         CSemitones(3765)},  // 0 2 4 5 7 9 10 11
    {st_min_harm,         CSemitones(2477)},  // 0 2 3 5 7 8 11
    {st_min_melo,         CSemitones(2733)},  // 0 2 3 5 7 9 11
    {st_maj_pent,         CSemitones(661)},   // 0 2 4 7 9
    {st_min_pent,         CSemitones(1193)},  // 0 3 5 7 10
    {st_maj_blues,        CSemitones(669)},   // 0 2 3 4 7 9
    {st_min_blues,        CSemitones(1257)},  // 0 3 5 6 7 10
    {st_lydian,           CSemitones(2773)},  // 0 2 4 6 7 9 11
    {st_mixolydian,       CSemitones(1717)},  // 0 2 4 5 7 9 10
    {st_dorian,           CSemitones(1709)},  // 0 2 3 5 7 9 10
    {st_phrygian,         CSemitones(1451)},  // 0 1 3 5 7 8 10
    {st_locrian,          CSemitones(1387)},  // 0 1 3 5 6 8 10
    {st_hm5,              CSemitones(1459)},  // 0 1 4 5 7 8 10
    {st_japanese,         CSemitones(419)},   // 0 1 5 7 8
    {st_southeast_asian,  CSemitones(395)},   // 0 1 3 7 8
    {st_custom,           CSemitones(0)},     // the scale's own row tells
    {DiminishedHalfWhole, CSemitones(1755)},  // 0 1 3 4 6 7 9 10
    {DiminishedWholeHalf, CSemitones(2925)},  // 0 2 3 5 6 8 9 11
    {BebopMajor,          CSemitones(2997)},  // 0 2 4 5 7 8 9 11
    {BebopDominant,       CSemitones(1973)},  // 0 2 4 5 7 8 9 10
    {BebopMelodicMinor,   CSemitones(2989)},  // 0 2 3 5 7 8 9 11
    {BebopHarmonicMinor,  CSemitones(3501)},  // 0 2 3 5 7 8 10 11
    {MixolydianSharp11,   CSemitones(1749)},  // 0 2 4 6 7 9 10
    {LocrianMaj2,         CSemitones(1389)},  // 0 2 3 5 6 8 10
    {Altered,             CSemitones(1371)},  // 0 1 3 4 6 8 10
    {DoubleHarmonic,      CSemitones(2483)},  // 0 1 4 5 7 8 11
});
// clang-format on

constexpr bool ScaleRowsStandInOrder() {
    for (std::size_t i = 0; i < kScaleMasks.size(); ++i) {
        if (kScaleMasks[i].mType != static_cast<TScaleType>(i + 1)) return false;
    }
    return kScaleMasks.size() + 1 == st_Count;
}
static_assert(ScaleRowsStandInOrder());

}  // namespace

CSemitones SemitonesFromScaleType(TScaleType type) {
    if (type < st_maj || type >= st_Count) return CSemitones_Undef;
    return kScaleMasks[static_cast<std::size_t>(type) - 1].mSemitones;
}

TScaleType ScaleTypeFromSemitones(CSemitones semitones) {
    if (semitones.IsEmpty()) return st_Undef;
    const auto row = std::find_if(
        kScaleMasks.begin(), kScaleMasks.end(),
        [semitones](const CScaleMask& entry) { return entry.mSemitones == semitones; });
    return row == kScaleMasks.end() ? st_custom : row->mType;
}

}  // namespace brindle
