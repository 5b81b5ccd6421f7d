// SPDX-License-Identifier: MIT
#include "brindle/platform/Localization.h"
#include "brindle/theory/CScaleHeavy.h"

#include <algorithm>

namespace brindle {

namespace {

constexpr int kRowOfMajor = 0;

constexpr bool IsRowIndex(int index) {
    return index >= 0 && index < CScaleHeavy::NumAvailableScales();
}

// By type, the index of its row; the row of major for a type without one.
constexpr auto kRowOfType = [] {
    std::array<std::int8_t, st_Count> rows{};
    rows.fill(kRowOfMajor);
    for (std::size_t row = 0; row < kScaleCatalogue.size(); ++row) {
        rows[static_cast<std::size_t>(kScaleCatalogue[row].mType)] = static_cast<std::int8_t>(row);
    }
    return rows;
}();

const CScaleRow& RowOfType(TScaleType type) {
    return kScaleCatalogue[static_cast<std::size_t>(CScaleHeavy::ScaleIndexFromType(type))];
}

struct CLocalizationKey {
    TScaleType mType;
    const char* mKey;
};

// clang-format off
constexpr auto kLocalizationKeys = std::to_array<CLocalizationKey>({
    {st_maj,              "Major (Ionian)"},
    {st_min,              "Natural Minor (Aeolian)"},
    {st_chrom,            "Chromatic"},
    {st_majmin,           "Major / Minor"},
    {st_majaddb7,         "Major + b7"},
    {st_min_harm,         "Harmonic Minor"},
    {st_min_melo,         "Melodic Minor"},
    {st_maj_pent,         "Major Pentatonic"},
    {st_min_pent,         "Minor Pentatonic"},
    {st_maj_blues,        "Major Blues"},
    {st_min_blues,        "Minor Blues"},
    {st_lydian,           "Lydian"},
    {st_mixolydian,       "Mixolydian"},
    {st_dorian,           "Dorian"},
    {st_phrygian,         "Phrygian"},
    {st_locrian,          "Locrian"},
    {st_hm5,              "Phrygian Dominant"},
    {st_japanese,         "Miyako-Bushi (Japanese)"},
    {st_southeast_asian,  "South-East Asian"},
    {st_custom,           "Custom"},
    {DiminishedHalfWhole, "Half-Whole Diminished"},
    {DiminishedWholeHalf, "Whole-Half Diminished"},
    {BebopMajor,          "Bebop Major"},
    {BebopDominant,       "Bebop Dominant"},
    {BebopMelodicMinor,   "Bebop Melodic Minor"},
    {BebopHarmonicMinor,  "Bebop Harmonic Minor"},
    {MixolydianSharp11,   "Mixolydian #11"},
    {LocrianMaj2,         "Locrian #2"},
    {Altered,             "Super Locrian (Altered)"},
    {DoubleHarmonic,      "Double Harmonic (Byzantine)"},
});
// clang-format on

}  // namespace

TScaleType CScaleHeavy::GetTypeForScaleAtIndex(int index) {
    return IsRowIndex(index) ? mScaleData[static_cast<std::size_t>(index)].mType : st_maj;
}

std::string_view CScaleHeavy::GetNameForScaleAtIndex(int index) {
    return mScaleData[static_cast<std::size_t>(IsRowIndex(index) ? index : kRowOfMajor)].mName;
}

int CScaleHeavy::ScaleIndexFromType(TScaleType type) {
    const auto ix = static_cast<std::uint32_t>(type);
    return ix < kRowOfType.size() ? kRowOfType[ix] : kRowOfMajor;
}

std::string_view CScaleHeavy::GetNameForScaleType(TScaleType type) {
    return RowOfType(type).mName;
}

TScaleMode CScaleHeavy::GetModeForScaleType(TScaleType type) {
    return RowOfType(type).mMode;
}

int CScaleHeavy::GetDegreesPerOctaveForScaleType(TScaleType type) {
    return RowOfType(type).mDegreesPerOctave;
}

const std::array<int, 12>& CScaleHeavy::GetDegreeToRootOffsetIntvlArrayForScaleType(
    TScaleType type) {
    return RowOfType(type).mDegreeToRootOffsetIntvl;
}

const std::array<TEnh, 12>& CScaleHeavy::GetDegreeEnhForScaleType(TScaleType type) {
    return RowOfType(type).mDegreeEnh;
}

std::optional<std::string> CScaleHeavy::LocalizedNameForScaleType(TScaleType type) {
    const auto row = std::find_if(kLocalizationKeys.begin(), kLocalizationKeys.end(),
                                  [type](const auto& key) { return key.mType == type; });
    if (row == kLocalizationKeys.end()) return std::nullopt;
    return LocalizedString(row->mKey);
}

const CScaleRow& CScaleHeavy::ScaleDataFromType(TScaleType type) const {
    return type == st_custom ? mCustomScaleData : RowOfType(type);
}

TScaleType CScaleHeavy::FindScaleTypeForCustomScale() const {
    const auto hasOwnSteps = [&own = mCustomScaleData](const CScaleRow& row) {
        return row.mDegreesPerOctave == own.mDegreesPerOctave &&
               row.mDegreeToRootOffsetIntvl == own.mDegreeToRootOffsetIntvl;
    };
    const auto row = std::find_if(mScaleData.begin(), mScaleData.end(), hasOwnSteps);
    return row == mScaleData.end() ? st_custom : row->mType;
}

}  // namespace brindle
