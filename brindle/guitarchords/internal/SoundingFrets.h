// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChChordElem.h"

#include <algorithm>
#include <cstddef>

namespace brindle {

/// How many frets a string that is not muted sounds above its open pitch, 0 if it is open: the real
/// element that was put down last on it holds it. `elemAt` gives the element at an index.
template <class TElemAt>
[[nodiscard]] int SoundingFret(std::size_t count, TElemAt elemAt, int stringIndex) {
    for (std::size_t i = count; i > 0; --i) {
        const GChChordElem& elem = elemAt(i - 1);
        if (elem.isReal() && elem.coversString(stringIndex)) return elem.absFretIndex() + 1;
    }
    return 0;
}

/// The pitch of a string that sounds `fret` frets above its open pitch; -1 for a negative fret, a
/// muted string. A negative capodaster counts as none.
[[nodiscard]] constexpr int SoundingPitch(int openPitch, int fret, int capodasterOffset) {
    // No real neck is longer, and the sum stays far from the end of the numbers.
    constexpr int kFarthestCapodaster = 1 << 20;
    return fret < 0 ? -1 : openPitch + fret + std::clamp(capodasterOffset, 0, kFarthestCapodaster);
}

}  // namespace brindle
