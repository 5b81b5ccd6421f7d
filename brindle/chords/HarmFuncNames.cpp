// SPDX-License-Identifier: MIT
#include "brindle/chords/HarmFuncNames.h"

#include "brindle/theory/CChordNamePrefs.h"

#include <array>
#include <cstddef>
#include <cstdint>

namespace brindle {

namespace {

struct CHarmFuncName {
    std::string_view roman;
    std::string_view inMajor;
    std::string_view inMinor;
};

// clang-format off
// By the number of the function. The "##" mark the spots that have no function letter of their own.
constexpr auto kHarmFuncNames = std::to_array<CHarmFuncName>({
    {"I",      "T",                "T"},
    {"Im",     "t",                "t"},
    {"II",     "DD / SP",          "DD / SP"},
    {"IIm",    "Sp",               "Sp"},
    {"IIdim",  "IIdim##",          "IIdim##"},
    {"III",    "TG",               "P"},
    {"IIIm",   "Sp",               "IIIm##in minor"},
    {"IV",     "S",                "S"},
    {"IVm",    "s",                "s"},
    {"V",      "D",                "D"},
    {"Vm",     "d",                "d"},
    {"VI",     "TP",               "sP = G"},
    {"VIm",    "Tp",               "sp"},
    {"bVII",   "SS",               "sp"},
    {"VIIdim", "VIIdim##in minor", "VIIdim##in minor"},
});
// clang-format on

/// The scale types whose functions have the names of major, type 2 at bit 0. Kept: they are not
/// the complement of the minor colours that decide whether a chord belongs to a key.
constexpr std::uint32_t kFunctionMajorTypes = 36174;

bool IsFunctionMinorType(TScaleType type) {
    const auto bit = static_cast<std::uint32_t>(type) - 2;
    return bit <= 17 && (kFunctionMajorTypes >> bit & 1) == 0;
}

}  // namespace

std::string_view HarmFuncName(int harmFunc, TScaleType type, const CChordNamePrefs& prefs) {
    const auto ix = static_cast<std::size_t>(harmFunc);
    if (ix >= kHarmFuncNames.size()) return "undef";
    const CHarmFuncName& name = kHarmFuncNames[ix];
    if (prefs.mChordPrefF != 1) return name.roman;
    return IsFunctionMinorType(type) ? name.inMinor : name.inMajor;
}

}  // namespace brindle
