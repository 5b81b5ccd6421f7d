// SPDX-License-Identifier: MIT
#include "brindle/theory/TScaleType.h"

#include <array>
#include <ostream>

namespace brindle {

namespace {

struct CWords {
    TScaleType mType;
    std::string_view mTraceWord;
    std::string_view mJSONWord;
};

// clang-format off
constexpr auto kWords = std::to_array<CWords>({
    // type              trace word             JSON word
    {st_Undef,            "st_Undef",            "Undef"},
    {st_maj,              "st_maj",              "maj"},
    {st_min,              "st_min",              "min"},
    {st_chrom,            "st_chrom",            "chrom"},
    {st_majmin,           "st_majmin",           "majmin"},
    {st_majaddb7,         "st_majaddb7",         "majaddb7"},
    {st_min_harm,         "st_min_harm",         "min_harm"},
    {st_min_melo,         "st_min_melo",         "min_melo"},
    {st_maj_pent,         "st_maj_pent",         "maj_pent"},
    {st_min_pent,         "st_min_pent",         "min_pent"},
    {st_maj_blues,        "st_maj_blues",        "maj_blues"},
    {st_min_blues,        "st_min_blues",        "min_blues"},
    {st_lydian,           "st_lydian",           "lyd"},
    {st_mixolydian,       "st_mixolydian",       "mixo"},
    {st_dorian,           "st_dorian",           "dori"},
    {st_phrygian,         "st_phrygian",         "phry"},
    {st_locrian,          "st_locrian",          "lokr"},
    {st_hm5,              "st_hm5",              "klez"},
    {st_japanese,         "st_japanese",         "jap"},
    {st_southeast_asian,  "st_southeast_asian",  "se_asian"},
    {st_custom,           "st_custom",           "custom"},
    {DiminishedHalfWhole, "DiminishedHalfWhole", "TScaleType::DiminishedHalfWhole"},
    {DiminishedWholeHalf, "DiminishedWholeHalf", "TScaleType::DiminishedWholeHalf"},
    {BebopMajor,          "BebopMajor",          "TScaleType::BebopMajor"},
    {BebopDominant,       "BebopDominant",       "TScaleType::BebopDominant"},
    {BebopMelodicMinor,   "BebopMelodicMinor",   "TScaleType::BebopMelodicMinor"},
    {BebopHarmonicMinor,  "BebopHarmonicMinor",  "TScaleType::BebopHarmonicMinor"},
    {MixolydianSharp11,   "MixolydianSharp11",   "TScaleType::MixolydianSharp11"},
    // Kept: the blank behind the word belongs to it.
    {LocrianMaj2,         "LocrianMaj2 ",        "TScaleType::LocrianMaj2 "},
    {Altered,             "Altered",             "TScaleType::Altered"},
    {DoubleHarmonic,      "DoubleHarmonic",      "TScaleType::DoubleHarmonic"},
    {st_Count,            "st_Count",            "st_Count"},
});
// clang-format on

constexpr bool EachRowIsAtItsType() {
    for (std::size_t i = 0; i < kWords.size(); ++i) {
        if (kWords[i].mType != static_cast<TScaleType>(i)) return false;
    }
    return true;
}
static_assert(EachRowIsAtItsType());

const CWords* WordsOf(TScaleType type) {
    const auto ix = static_cast<std::uint32_t>(type);
    return ix < kWords.size() ? &kWords[ix] : nullptr;
}

TScaleType Stepped(TScaleType type, std::uint32_t step) {
    return static_cast<TScaleType>(
        static_cast<std::int32_t>(static_cast<std::uint32_t>(type) + step));
}

}  // namespace

std::string_view ToJSONString(TScaleType type) {
    const CWords* words = WordsOf(type);
    return words == nullptr ? "undef" : words->mJSONWord;
}

TScaleType ScaleTypeFromJSONString(std::string_view word) {
    for (const CWords& words : kWords) {
        if (words.mType > st_custom) break;
        if (words.mJSONWord == word) return words.mType;
    }
    return st_Undef;
}

TScaleType& operator++(TScaleType& type) {
    return type = Stepped(type, 1u);
}

TScaleType operator++(TScaleType& type, int) {
    const TScaleType before = type;
    ++type;
    return before;
}

TScaleType& operator--(TScaleType& type) {
    return type = Stepped(type, ~0u);
}

TScaleType operator--(TScaleType& type, int) {
    const TScaleType before = type;
    --type;
    return before;
}

std::ostream& operator<<(std::ostream& stream, TScaleType type) {
    const CWords* words = WordsOf(type);
    return stream << (words == nullptr ? "undef" : words->mTraceWord);
}

}  // namespace brindle
