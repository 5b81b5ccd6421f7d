// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/KeyIntervals.h"

#include <array>
#include <cstddef>

namespace brindle {

/// Key number of a letter, 0 (C) to 6 (B).
[[nodiscard]] constexpr int KeyNrOfLetter(int letter) {
    return kNaturalKeyNrs[static_cast<std::size_t>(letter)];
}

/// The letter that a spelled key is written with, 0 (C) to 6 (B). A spelling that makes no sense
/// counts as the letter below.
[[nodiscard]] constexpr int LetterOf(const CKeyEnh& key) {
    constexpr std::array<int, 12> kLetters{0, 0, 1, 1, 2, 3, 3, 4, 4, 5, 5, 6};
    return kLetters[static_cast<std::size_t>(FoldIntoOctave(key.mKeyNr - EnhToSemitone(key.mEnh)))];
}

/// The place of a spelled key on the line of fifths: F -1, C 0, G 1, B 5, F sharp 6, B flat -2.
[[nodiscard]] constexpr int PlaceOnLineOfFifths(const CKeyEnh& key) {
    constexpr std::array<int, 7> kPlaces{0, 2, 4, -1, 1, 3, 5};
    return kPlaces[static_cast<std::size_t>(LetterOf(key))] + 7 * EnhToSemitone(key.mEnh);
}

}  // namespace brindle
