// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/MakeSensefulEnh.h"

namespace brindle {

// One step of respelling, towards flats, towards sharps, or to and fro. A key number is first
// reduced into 0 to 11, unless it is 15. `TEnh_Undef` counts as natural.
//
// Each step comes in two forms: keys take triple accidentals as double ones; notes take them as
// they are, by the forms named Unclamped.

/// As EnhShiftToFlats, with triple accidentals as they are.
[[nodiscard]] constexpr TEnh EnhShiftToFlatsUnclamped(int keyNr, TEnh enh) {
    const TEnh c = enh == TEnh_Undef ? TEnh_n : enh;
    switch (FoldKeyNr(keyNr)) {
        case 0:
        case 5:
            if (c == TEnh_ss) return TEnh_s;
            return c == TEnh_s ? TEnh_n : TEnh_bb;
        case 1:
        case 6:
        case 8:
            return c == TEnh_ss ? TEnh_s : TEnh_b;
        case 3:
        case 10:
            if (c == TEnh_ss) return TEnh_s;
            return c == TEnh_n || c == TEnh_s ? TEnh_b : TEnh_bb;
        case 4:
        case 11:
            return c == TEnh_s || c == TEnh_ss ? TEnh_n : TEnh_b;
        default:  // 2, 7, 9 and the undefined key
            return c == TEnh_s || c == TEnh_ss ? TEnh_n : TEnh_bb;
    }
}

/// As EnhShiftToSharps, with triple accidentals as they are.
[[nodiscard]] constexpr TEnh EnhShiftToSharpsUnclamped(int keyNr, TEnh enh) {
    const TEnh c = enh == TEnh_Undef ? TEnh_n : enh;
    switch (FoldKeyNr(keyNr)) {
        case 0:
        case 5:
            return c < TEnh_n ? TEnh_n : TEnh_s;
        case 1:
        case 6:
            if (c >= TEnh_s) return TEnh_ss;
            return c == TEnh_bb ? TEnh_b : TEnh_s;
        case 3:
        case 8:
        case 10:
            return c == TEnh_bb ? TEnh_b : TEnh_s;
        case 4:
        case 11:
            if (c == TEnh_bb) return TEnh_b;
            return c == TEnh_b ? TEnh_n : TEnh_ss;
        default:  // 2, 7, 9 and the undefined key
            return c < TEnh_n ? TEnh_n : TEnh_ss;
    }
}

/// As EnhShift, with triple accidentals as they are.
[[nodiscard]] constexpr TEnh EnhShiftUnclamped(int keyNr, TEnh enh) {
    const TEnh c = enh == TEnh_Undef ? TEnh_n : enh;
    const int key = FoldKeyNr(keyNr);
    // Meant: plain E and B turn to F flat and C flat, but plain C and F to B sharp and E sharp.
    const bool naturalIsSharp = key == 4 || key == 11;
    const bool isSharp = c == TEnh_s || c == TEnh_ss || (naturalIsSharp && c == TEnh_n);
    return isSharp ? EnhShiftToFlatsUnclamped(key, c) : EnhShiftToSharpsUnclamped(key, c);
}

/// One step of respelling towards flats: C sharp becomes D flat.
[[nodiscard]] constexpr TEnh EnhShiftToFlats(int keyNr, TEnh enh) {
    return EnhShiftToFlatsUnclamped(keyNr, ClampEnhToDoubleAccidentals(enh));
}
/// One step of respelling towards sharps: D flat becomes C sharp.
[[nodiscard]] constexpr TEnh EnhShiftToSharps(int keyNr, TEnh enh) {
    return EnhShiftToSharpsUnclamped(keyNr, ClampEnhToDoubleAccidentals(enh));
}
/// Toggles a spelling: sharps shift to flats, all others to sharps.
[[nodiscard]] constexpr TEnh EnhShift(int keyNr, TEnh enh) {
    return EnhShiftUnclamped(keyNr, ClampEnhToDoubleAccidentals(enh));
}

}  // namespace brindle
