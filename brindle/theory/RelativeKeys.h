// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/KeyIntervals.h"

#include <cstdint>

namespace brindle {

/// A key counted in semitones from a root, 0 to 11; 15 when either is undefined.
[[nodiscard]] constexpr int RelativeKeyNr(int rootKeyNr, int keyNr) {
    if (rootKeyNr == kKeyNrUndef || keyNr == kKeyNrUndef) return kKeyNrUndef;
    return FoldIntoOctave(std::int64_t{keyNr} - rootKeyNr);
}

/// The key that stands `relativeKeyNr` semitones above a root; 15 when either is undefined.
[[nodiscard]] constexpr int KeyNrFromRelativeKeyNr(int rootKeyNr, int relativeKeyNr) {
    if (rootKeyNr == kKeyNrUndef || relativeKeyNr == kKeyNrUndef) return kKeyNrUndef;
    return FoldIntoOctave(std::int64_t{rootKeyNr} + relativeKeyNr);
}

}  // namespace brindle
