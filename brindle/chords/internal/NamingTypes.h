// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/ChordDegree.h"
#include "brindle/chords/internal/NamingTables.h"
#include "brindle/platform/Ascii.h"

#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>

namespace brindle {

/// Tones above a root: bit n is the tone n semitones up.
using TToneMask = std::uint32_t;

[[nodiscard]] constexpr bool HasTone(TToneMask tones, int tone) {
    return tone >= 0 && (tones >> tone & 1U) != 0;
}

/// A chord type made ready for the search.
struct CNamingType {
    static constexpr std::size_t kMostDegrees = 7;

    std::array<CChordDegree, kMostDegrees> mDegrees{};
    TToneMask mTones = 0;
    /// Those that are usually left out.
    TToneMask mOptional = 0;
    /// Of the third, -1 if the type has none.
    int mThird = -1;
    /// A sixth chord without its fifth is another chord over its sixth.
    bool mIsPlainSixth = false;
};

/// A row of kNamingTypeRows, "1 b3 5 b7 (9)", made ready.
[[nodiscard]] constexpr CNamingType MakeNamingType(const CNamingTypeRow& row) {
    CNamingType type;
    std::size_t count = 0;
    CChordDegree degree;
    bool isOptional = false;
    const auto take = [&] {
        if (degree.IsUndef()) return;
        const TToneMask tone = TToneMask{1} << degree.Tone();
        type.mTones |= tone;
        if (isOptional) type.mOptional |= tone;
        if (count == 1 && degree.mNumber == 3) type.mThird = degree.Tone();
        type.mDegrees[count++] = degree;
        degree = {};
    };
    for (const char letter : row.mDegrees) {
        if (letter == ' ') take();
        if (letter == '(') isOptional = true;
        if (letter == 'b') --degree.mSigns;
        if (letter == '#') ++degree.mSigns;
        if (Ascii::IsDigit(letter)) degree.mNumber = degree.mNumber * 10 + letter - '0';
        if (letter == ')') {
            take();
            isOptional = false;
        }
    }
    take();
    type.mIsPlainSixth = row.mSuffix == "6" || row.mSuffix == "m6";
    return type;
}

inline constexpr auto kNamingTypes = [] {
    std::array<CNamingType, kNamingTypeRows.size()> types{};
    for (std::size_t ix = 0; ix < types.size(); ++ix)
        types[ix] = MakeNamingType(kNamingTypeRows[ix]);
    return types;
}();

inline constexpr TToneMask kMajorTriadTones = 0x091;  // 0 4 7
inline constexpr TToneMask kMinorTriadTones = 0x089;  // 0 3 7

/// The tones without which a type is not itself. The root, the fifth and the third can be missing,
/// but triads need their third, and plain sixths their fifth.
[[nodiscard]] constexpr TToneMask NeededTones(const CNamingType& type) {
    TToneMask needed = type.mTones & ~type.mOptional & ~TToneMask{1};
    if (!type.mIsPlainSixth) needed &= ~(TToneMask{1} << 7);
    const bool isTriad = type.mTones == kMajorTriadTones || type.mTones == kMinorTriadTones;
    if (type.mThird >= 0 && !isTriad) needed &= ~(TToneMask{1} << type.mThird);
    return needed;
}

/// A row of the tables of the context.
enum TNamingFamily : std::uint8_t {
    TNamingFamily_Dominant = 0,
    TNamingFamily_Major = 1,
    TNamingFamily_Minor = 2,
    TNamingFamily_Diminished = 3,
    TNamingFamily_Other = 4,
};

[[nodiscard]] constexpr TNamingFamily NamingFamilyOf(TToneMask tones) {
    if (HasTone(tones, 4)) return HasTone(tones, 10) ? TNamingFamily_Dominant : TNamingFamily_Major;
    if (!HasTone(tones, 3)) return TNamingFamily_Other;
    const bool isDiminished = HasTone(tones, 6) && !HasTone(tones, 7);
    return isDiminished ? TNamingFamily_Diminished : TNamingFamily_Minor;
}

}  // namespace brindle
