// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CNote.h"
#include "brindle/theory/KeyIntervals.h"

#include <cstdint>
#include <iosfwd>

namespace brindle {

/// Which way a melody goes or a search looks.
enum TKeyDirection : std::int32_t {
    TKeyDirection_Closest = 0,  ///< whichever way is shorter, or unknown
    TKeyDirection_Up = 1,       ///< to a higher note
    TKeyDirection_Down = 2,     ///< to a lower note
};

/// Writes "Closest", "Up" or "Down", or "unknown TKeyDirection " and the number.
std::ostream& operator<<(std::ostream& stream, TKeyDirection direction);

/// Down when b lies below a, Up otherwise; Closest when either is undefined.
[[nodiscard]] TKeyDirection KeyDirectionFrom(std::int64_t a, std::int64_t b);
/// The same of two notes.
[[nodiscard]] TKeyDirection KeyDirectionFrom(const CNote& a, const CNote& b);

/// From note a to note b in semitones. `kIntvlUndef` when either is undefined.
[[nodiscard]] int IntvlFromTo(std::int64_t a, std::int64_t b);
/// The same of two notes.
[[nodiscard]] int IntvlFromTo(const CNote& a, const CNote& b);
/// The same where 255 is a number, and only -1 is undefined.
[[nodiscard]] int IntvlFromToTolerateNoteNrSmallUndef(std::int64_t a, std::int64_t b);
/// How far two notes lie apart in semitones. `kIntvlUndef` when either is undefined.
[[nodiscard]] int DistanceBetween(const CNote& a, const CNote& b);

// The functions of KeyIntervals.h on the keys of two notes.

/// From the key of a to the key of b, -11 to 11.
[[nodiscard]] int KeyIntvlFromTo(const CNote& a, const CNote& b);
/// From the key of a up to the key of b, 0 to 11.
[[nodiscard]] int AbsKeyIntvlFromTo(const CNote& a, const CNote& b);
/// The same by the shorter way, -6 to 5.
[[nodiscard]] int SmallestKeyIntvlBetween(const CNote& a, const CNote& b);
/// How far the keys lie apart by the shorter way, 0 to 6.
[[nodiscard]] int KeyDistanceBetween(const CNote& a, const CNote& b);

/// The lowest note number at which an interval still sounds clear; 0 for an octave, which has no
/// limit, and for intervals below 1. An interval above 14 semitones counts as the one that lies
/// whole octaves below it in 3 to 14.
[[nodiscard]] int LowIntervalLimit(int intvl);

}  // namespace brindle
