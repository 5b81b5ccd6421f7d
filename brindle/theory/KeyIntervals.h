// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/Ascii.h"
#include "brindle/theory/CKeyEnh.h"

#include <array>
#include <cstddef>
#include <cstdint>

namespace brindle {

/// The interval from or to a key that is undefined. Real intervals are semitones, negative for
/// down.
inline constexpr int kIntvlUndef = -129;

/// The pitch classes of the letters C D E F G A B, and so the semitones of the degrees of a major
/// scale above its tonic.
inline constexpr std::array<int, 7> kNaturalKeyNrs{0, 2, 4, 5, 7, 9, 11};

/// The pitch class of a letter, A to G in either case; `kKeyNrUndef` for any other character.
[[nodiscard]] constexpr int KeyNrOfLetter(char letter) {
    const char capital = Ascii::ToUpper(letter);
    if (capital < 'A' || capital > 'G') return kKeyNrUndef;
    return kNaturalKeyNrs[static_cast<std::size_t>((capital - 'A' + 5) % 7)];
}

/// A number of semitones as one octave holds it: the true remainder by 12, 0 to 11.
[[nodiscard]] constexpr int FoldIntoOctave(std::int64_t semitones) {
    const auto remainder = static_cast<int>(semitones % 12);
    return remainder < 0 ? remainder + 12 : remainder;
}

/// A key number reduced into 0 to 11, unless it is 15: the undefined key stays.
[[nodiscard]] constexpr int FoldKeyNr(int keyNr) {
    return keyNr == kKeyNrUndef ? kKeyNrUndef : FoldIntoOctave(keyNr);
}

/// From key a to key b in semitones, not reduced: -11 to 11. `kIntvlUndef` when either is 15.
[[nodiscard]] constexpr int KeyIntvlFromTo(int a, int b) {
    if (a == kKeyNrUndef || b == kKeyNrUndef) return kIntvlUndef;
    return static_cast<int>(std::int64_t{b} - a);
}

/// From key a up to key b, 0 to 11. `kIntvlUndef` when either is 15.
[[nodiscard]] constexpr int AbsKeyIntvlFromTo(int a, int b) {
    if (a == kKeyNrUndef || b == kKeyNrUndef) return kIntvlUndef;
    return FoldIntoOctave(std::int64_t{b} - a);
}

/// An interval of -11 to 11 by its shorter way, -6 to 5: a sixth up is a third down. The tritone is
/// always -6.
[[nodiscard]] constexpr int SmallestKeyIntvl(int intvl) {
    if (intvl == kIntvlUndef) return kIntvlUndef;
    if (intvl >= 6) return intvl - 12;
    return intvl < -6 ? intvl + 12 : intvl;
}

/// From key a to key b by the shorter way, -6 to 5. `kIntvlUndef` when either is 15.
[[nodiscard]] constexpr int SmallestKeyIntvlBetween(int a, int b) {
    return SmallestKeyIntvl(KeyIntvlFromTo(a, b));
}

/// How far two keys lie apart by the shorter way, 0 to 6. `kIntvlUndef` when either is 15.
[[nodiscard]] constexpr int KeyDistanceBetween(int a, int b) {
    const int intvl = KeyIntvlFromTo(a, b);
    if (intvl == kIntvlUndef) return kIntvlUndef;
    const std::int64_t distance = intvl < 0 ? -std::int64_t{intvl} : intvl;
    return static_cast<int>(distance < 7 ? distance : 12 - distance);
}

}  // namespace brindle
