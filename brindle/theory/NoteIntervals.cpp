// SPDX-License-Identifier: MIT
#include "brindle/theory/NoteIntervals.h"

#include <array>
#include <cstdlib>
#include <ostream>

namespace brindle {

namespace {

// The lowest clear note of the intervals 1 to 14.
constexpr auto kLowIntervalLimits =
    std::to_array({53, 53, 50, 50, 51, 51, 41, 51, 50, 51, 51, 0, 51, 53});

/// As unsigned numbers, so that numbers far off the keyboard cannot overflow.
int Difference(std::int64_t a, std::int64_t b) {
    return static_cast<int>(static_cast<std::uint64_t>(b) - static_cast<std::uint64_t>(a));
}

}  // namespace

std::ostream& operator<<(std::ostream& stream, TKeyDirection direction) {
    switch (direction) {
        case TKeyDirection_Closest:
            return stream << "Closest";
        case TKeyDirection_Up:
            return stream << "Up";
        case TKeyDirection_Down:
            return stream << "Down";
    }
    return stream << "unknown TKeyDirection " << static_cast<std::int32_t>(direction);
}

TKeyDirection KeyDirectionFrom(std::int64_t a, std::int64_t b) {
    if (IsNoteNrUndef(a) || IsNoteNrUndef(b)) return TKeyDirection_Closest;
    return b < a ? TKeyDirection_Down : TKeyDirection_Up;
}

TKeyDirection KeyDirectionFrom(const CNote& a, const CNote& b) {
    return KeyDirectionFrom(a.mNoteNr, b.mNoteNr);
}

int IntvlFromTo(std::int64_t a, std::int64_t b) {
    return IsNoteNrUndef(a) || IsNoteNrUndef(b) ? kIntvlUndef : Difference(a, b);
}

int IntvlFromTo(const CNote& a, const CNote& b) {
    return IntvlFromTo(a.mNoteNr, b.mNoteNr);
}

int IntvlFromToTolerateNoteNrSmallUndef(std::int64_t a, std::int64_t b) {
    return a == kNoteNrUndef || b == kNoteNrUndef ? kIntvlUndef : Difference(a, b);
}

int DistanceBetween(const CNote& a, const CNote& b) {
    if (a.IsUndef() || b.IsUndef()) return kIntvlUndef;
    return static_cast<int>(std::abs(std::int64_t{Difference(a.mNoteNr, b.mNoteNr)}));
}

int KeyIntvlFromTo(const CNote& a, const CNote& b) {
    return KeyIntvlFromTo(a.KeyNr(), b.KeyNr());
}

int AbsKeyIntvlFromTo(const CNote& a, const CNote& b) {
    return AbsKeyIntvlFromTo(a.KeyNr(), b.KeyNr());
}

int SmallestKeyIntvlBetween(const CNote& a, const CNote& b) {
    return SmallestKeyIntvlBetween(a.KeyNr(), b.KeyNr());
}

int KeyDistanceBetween(const CNote& a, const CNote& b) {
    return KeyDistanceBetween(a.KeyNr(), b.KeyNr());
}

int LowIntervalLimit(int intvl) {
    if (intvl < 1) return 0;
    const int reduced = intvl > 14 ? 3 + (intvl - 3) % 12 : intvl;
    return kLowIntervalLimits[static_cast<std::size_t>(reduced - 1)];
}

}  // namespace brindle
