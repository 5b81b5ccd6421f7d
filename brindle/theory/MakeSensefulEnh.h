// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/SensefulSpellings.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>

namespace brindle {

// Which spellings of a key can be written down, and which enharmonic name stands for one that
// cannot. A key number is first reduced into 0 to 11, unless it is 15, the undefined key.

/// The rule by which MakeSensefulEnhForKeyNr repairs; each selects the function of its name.
enum TMakeSensefulEnh : std::int32_t {
    TMakeSensefulEnh_AssumingCMajor = 0,  ///< a usual spelling in C major
    /// As the root of a major scale of few signs.
    TMakeSensefulEnh_MajorScaleRootWithLeastSigns = 1,
    TMakeSensefulEnh_PreferSharps = 2,               ///< black keys are sharp
    TMakeSensefulEnh_PreferFlats = 3,                ///< black keys are flat
    TMakeSensefulEnh_OnBlackKeyPreferGivenTEnh = 4,  ///< white keys are plain, black ones stay
};

/// Whether one of the seven letters with this accidental is this key. Key 15 goes with
/// `TEnh_Undef` alone.
[[nodiscard]] constexpr bool IsSensefulEnhForKeyNr(int keyNr, TEnh enh) {
    const int key = FoldKeyNr(keyNr);
    if (key == kKeyNrUndef) return enh == TEnh_Undef;
    if (enh < TEnh_bbb || enh > TEnh_sss) return false;
    return (kSensefulEnhsOfKeyNr[static_cast<std::size_t>(key)] >> (enh - TEnh_bbb) & 1U) != 0;
}

/// Triple accidentals as double ones.
[[nodiscard]] constexpr TEnh ClampEnhToDoubleAccidentals(TEnh enh) {
    return enh == TEnh_Undef ? TEnh_Undef : std::clamp(enh, TEnh_bb, TEnh_ss);
}

/// Triple accidentals become double ones; then a spelling that makes sense stays, and another
/// becomes the nearest common one. From `TEnh_Undef` come the default spellings: C, C sharp, D,
/// E flat, E, F, F sharp, G, G sharp, A, B flat, B.
[[nodiscard]] constexpr TEnh MakeSensefulEnhForKeyNrAssumingCMajor(int keyNr, TEnh enh) {
    const TEnh clamped = ClampEnhToDoubleAccidentals(enh);
    if (IsSensefulEnhForKeyNr(keyNr, clamped)) return clamped;
    // clang-format off
    switch (FoldKeyNr(keyNr)) {
        case 0: case 5:          return clamped == TEnh_ss ? TEnh_s : TEnh_n;
        case 1: case 6: case 8:  return clamped == TEnh_bb ? TEnh_b : TEnh_s;
        case 2: case 7: case 9:  return TEnh_n;
        case 3: case 10:         return clamped == TEnh_ss ? TEnh_s : TEnh_b;
        case 4: case 11:         return clamped == TEnh_bb ? TEnh_b : TEnh_n;
        default:                 return TEnh_Undef;
    }
    // clang-format on
}

/// As AssumingCMajor, then D flat, E flat, A flat and B flat are preferred to their sharp forms,
/// whose major scales have more signs. Key 6 keeps what it was given.
[[nodiscard]] constexpr TEnh MakeSensefulEnhForKeyNrMajorScaleRootWithLeastSigns(int keyNr,
                                                                                 TEnh enh) {
    const TEnh repaired = MakeSensefulEnhForKeyNrAssumingCMajor(keyNr, enh);
    switch (FoldKeyNr(keyNr)) {
        case 1:
            // A repaired key 1 is never double flat. The row stands for the rule's sake.
            return repaired == TEnh_bb || repaired == TEnh_ss ? repaired : TEnh_b;
        case 3:
        case 10:
            return repaired == TEnh_bb ? TEnh_bb : TEnh_b;
        case 8:
            return TEnh_b;
        default:
            return repaired;
    }
}

/// As AssumingCMajor, then black keys become sharp, and E and B are not written F flat and C flat.
[[nodiscard]] constexpr TEnh MakeSensefulEnhForKeyNrPreferSharps(int keyNr, TEnh enh) {
    if (keyNr == kKeyNrUndef) return TEnh_Undef;
    const int key = FoldKeyNr(keyNr);
    if (IsBlackKey(key)) return TEnh_s;
    const TEnh repaired = MakeSensefulEnhForKeyNrAssumingCMajor(key, enh);
    return (key == 4 || key == 11) && repaired == TEnh_b ? TEnh_n : repaired;
}

/// As AssumingCMajor, then black keys become flat, and C and F are not written B and E sharp.
[[nodiscard]] constexpr TEnh MakeSensefulEnhForKeyNrPreferFlats(int keyNr, TEnh enh) {
    if (keyNr == kKeyNrUndef) return TEnh_Undef;
    const int key = FoldKeyNr(keyNr);
    if (IsBlackKey(key)) return TEnh_b;
    const TEnh repaired = MakeSensefulEnhForKeyNrAssumingCMajor(key, enh);
    return (key == 0 || key == 5) && repaired == TEnh_s ? TEnh_n : repaired;
}

/// White keys become natural; a black key keeps a spelling that makes sense, or becomes sharp.
[[nodiscard]] constexpr TEnh MakeSensefulEnhForKeyNrOnBlackKeyPreferGivenTEnh(int keyNr, TEnh enh) {
    if (keyNr == kKeyNrUndef) return TEnh_Undef;
    if (IsWhiteKey(FoldKeyNr(keyNr))) return TEnh_n;
    return IsSensefulEnhForKeyNr(keyNr, enh) ? enh : TEnh_s;
}

/// Repairs by the rule `mode`. Key 15 and an unknown rule give `TEnh_Undef`.
[[nodiscard]] constexpr TEnh MakeSensefulEnhForKeyNr(int keyNr, TEnh enh, TMakeSensefulEnh mode) {
    if (keyNr == kKeyNrUndef) return TEnh_Undef;
    switch (mode) {
        case TMakeSensefulEnh_AssumingCMajor:
            return MakeSensefulEnhForKeyNrAssumingCMajor(keyNr, enh);
        case TMakeSensefulEnh_MajorScaleRootWithLeastSigns:
            return MakeSensefulEnhForKeyNrMajorScaleRootWithLeastSigns(keyNr, enh);
        case TMakeSensefulEnh_PreferSharps:
            return MakeSensefulEnhForKeyNrPreferSharps(keyNr, enh);
        case TMakeSensefulEnh_PreferFlats:
            return MakeSensefulEnhForKeyNrPreferFlats(keyNr, enh);
        case TMakeSensefulEnh_OnBlackKeyPreferGivenTEnh:
            return MakeSensefulEnhForKeyNrOnBlackKeyPreferGivenTEnh(keyNr, enh);
    }
    return TEnh_Undef;
}

}  // namespace brindle
