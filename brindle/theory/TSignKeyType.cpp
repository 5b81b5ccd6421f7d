// SPDX-License-Identifier: MIT
#include "brindle/theory/TSignKeyType.h"

#include "brindle/theory/Trace.h"

#include <array>
#include <cstddef>
#include <ostream>

namespace brindle {

namespace {

struct CScaleColour {
    TScaleType mScaleType;
    TSignKeyType mSignKeyType;
};

// The key signature under which a scale is written.
// clang-format off
constexpr auto kScaleColours = std::to_array<CScaleColour>({
    {st_min,             TSignKeyType_Minor},
    {st_chrom,           TSignKeyType_Major},
    {st_majmin,          TSignKeyType_Major},
    {st_majaddb7,        TSignKeyType_Major},
    {st_min_harm,        TSignKeyType_Minor},
    {st_min_melo,        TSignKeyType_Minor},
    {st_maj_pent,        TSignKeyType_Major},
    {st_min_pent,        TSignKeyType_Minor},
    {st_maj_blues,       TSignKeyType_Major},
    {st_min_blues,       TSignKeyType_Minor},
    {st_lydian,          TSignKeyType_Major},
    {st_mixolydian,      TSignKeyType_Major},
    {st_dorian,          TSignKeyType_Minor},
    {st_phrygian,        TSignKeyType_Minor},
    {st_locrian,         TSignKeyType_Minor},
    {st_hm5,             TSignKeyType_Major},
    {st_japanese,        TSignKeyType_Minor},
    {st_southeast_asian, TSignKeyType_Minor},
});
// clang-format on

constexpr bool SignKeyRowsStandInOrder() {
    for (std::size_t i = 0; i < kScaleColours.size(); ++i) {
        if (kScaleColours[i].mScaleType != static_cast<TScaleType>(i + st_min)) return false;
    }
    return true;
}
static_assert(SignKeyRowsStandInOrder());

}  // namespace

TSignKeyType SignKeyTypeFromScaleType(TScaleType type) {
    if (type < kScaleColours.front().mScaleType || type > kScaleColours.back().mScaleType) {
        return TSignKeyType_Major;
    }
    return kScaleColours[static_cast<std::size_t>(type - st_min)].mSignKeyType;
}

TSignKeyTypeNoUndef SignKeyTypeNoUndefFromScaleType(TScaleType type) {
    return FromSignKeyType(SignKeyTypeFromScaleType(type));
}

TSignKeyType SignKeyTypeFromString(std::string_view word) {
    if (word == "major") return TSignKeyType_Major;
    if (word == "minor") return TSignKeyType_Minor;
    return TSignKeyType_Undef;
}

TSignKeyTypeNoUndef SignKeyTypeNoUndefFromString(std::string_view word) {
    return FromSignKeyType(SignKeyTypeFromString(word));
}

std::string_view JSONWord(TSignKeyType type) {
    switch (type) {
        case TSignKeyType_Undef:
            return "undef";
        case TSignKeyType_Major:
            return "major";
        case TSignKeyType_Minor:
            return "minor";
    }
    return "undef";
}

std::string StringForInitializerList(TSignKeyType type) {
    return "TSignKeyType::" + TraceString(type);
}

std::ostream& operator<<(std::ostream& stream, TSignKeyType type) {
    switch (type) {
        case TSignKeyType_Undef:
            return stream << "Undef";
        case TSignKeyType_Major:
            return stream << "Major";
        case TSignKeyType_Minor:
            return stream << "Minor";
    }
    return stream << "unkown TSignKeyType";
}

std::ostream& operator<<(std::ostream& stream, TSignKeyTypeNoUndef type) {
    switch (type) {
        case TSignKeyTypeNoUndef_Major:
            return stream << "Major";
        case TSignKeyTypeNoUndef_Minor:
            return stream << "Minor";
    }
    return stream << "unkown TSignKeyTypeNoUndef";
}

}  // namespace brindle
