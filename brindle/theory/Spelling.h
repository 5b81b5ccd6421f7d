// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"

#include <cstdint>

namespace brindle {

// Which spellings of a key can be written down, and how one that cannot is repaired. A key number
// is first reduced into 0 to 11, unless it is 15, the undefined key.

/// The rule by which MakeSensefulEnhForKeyNr repairs; each selects the function of its name.
enum TMakeSensefulEnh : std::int32_t {
    TMakeSensefulEnh_AssumingCMajor = 0,
    TMakeSensefulEnh_MajorScaleRootWithLeastSigns = 1,
    TMakeSensefulEnh_PreferSharps = 2,
    TMakeSensefulEnh_PreferFlats = 3,
    TMakeSensefulEnh_OnBlackKeyPreferGivenTEnh = 4,
};

/// Whether one of the seven letters with this accidental is this key. Key 15 goes with
/// `TEnh_Undef` alone.
[[nodiscard]] bool IsSensefulEnhForKeyNr(int keyNr, TEnh enh);

/// Repairs by the rule `mode`. Key 15 and an unknown rule give `TEnh_Undef`.
[[nodiscard]] TEnh MakeSensefulEnhForKeyNr(int keyNr, TEnh enh, TMakeSensefulEnh mode);

/// Triple accidentals become double ones; then a spelling that makes sense stays, and another
/// becomes the nearest common one. From `TEnh_Undef` come the default spellings: C, C sharp, D,
/// E flat, E, F, F sharp, G, G sharp, A, B flat, B.
[[nodiscard]] TEnh MakeSensefulEnhForKeyNrAssumingCMajor(int keyNr, TEnh enh);
/// As AssumingCMajor, then D flat, E flat, A flat and B flat are preferred to their sharp forms,
/// whose major scales have more signs. Key 6 keeps what it was given.
[[nodiscard]] TEnh MakeSensefulEnhForKeyNrMajorScaleRootWithLeastSigns(int keyNr, TEnh enh);
/// As AssumingCMajor, then black keys become sharp, and E and B are not written F flat and C flat.
[[nodiscard]] TEnh MakeSensefulEnhForKeyNrPreferSharps(int keyNr, TEnh enh);
/// As AssumingCMajor, then black keys become flat, and C and F are not written B and E sharp.
[[nodiscard]] TEnh MakeSensefulEnhForKeyNrPreferFlats(int keyNr, TEnh enh);
/// White keys become natural; a black key keeps a spelling that makes sense, or becomes sharp.
[[nodiscard]] TEnh MakeSensefulEnhForKeyNrOnBlackKeyPreferGivenTEnh(int keyNr, TEnh enh);

/// One step of respelling towards flats: C sharp becomes D flat. Triple accidentals count as
/// double ones, `TEnh_Undef` as natural.
[[nodiscard]] TEnh EnhShiftToFlats(int keyNr, TEnh enh);
/// One step of respelling towards sharps: D flat becomes C sharp.
[[nodiscard]] TEnh EnhShiftToSharps(int keyNr, TEnh enh);
/// Toggles a spelling: sharps shift to flats, all others to sharps. E and B turn to F flat and
/// C flat, while C and F turn to B sharp and E sharp.
[[nodiscard]] TEnh EnhShift(int keyNr, TEnh enh);

// The same three steps without the rule for triple accidentals, as a note takes them.

[[nodiscard]] TEnh EnhShiftToFlatsUnclamped(int keyNr, TEnh enh);
[[nodiscard]] TEnh EnhShiftToSharpsUnclamped(int keyNr, TEnh enh);
[[nodiscard]] TEnh EnhShiftUnclamped(int keyNr, TEnh enh);

}  // namespace brindle
