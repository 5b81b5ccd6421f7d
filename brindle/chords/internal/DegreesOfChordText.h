// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/internal/CTextScan.h"

#include <optional>

namespace brindle::ChordText {

/// A word or sign for major: `maj`, `M`, `^`.
enum class TMajorMark { Major, Seventh };

/// Reads the number of a degree and moves behind it: 13, 11, 10, or a digit of 2 3 4 5 6 7 9, also
/// as `7th` or `seventh`. Digits are cut: `69` is 6 and then 9. 0 if there is none.
int TakeNumber(CTextScan& scan);

/// Reads a sign before a number, `b`, `#`, `+`, `-` or a word for it: -1, +1; 0 if there is none.
int TakeSign(CTextScan& scan);

/// Reads a word for major with a dot behind it, if there is one.
std::optional<TMajorMark> TakeMajorMark(CTextScan& scan);

}  // namespace brindle::ChordText
