// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/present/CPaint.h"
#include "brindle/present/internal/ReadingBars.h"

#include <span>
#include <string>

namespace brindle {

/// What lines of bars are made of.
struct CReadingLines {
    std::span<const CReadingBar> mBars;
    std::size_t mWidth = 80;
};

/// The bars of a song, four a line, two or one where that is too wide: the chords, the numerals
/// below, and above the names of the keys where they begin. A part of the song begins a new line,
/// an upbeat has one for itself. A chord that is told several times in a row stands once in a bar.
[[nodiscard]] std::string ReadingLines(const CSong& song, const CSongReading& reading,
                                       const CReadingLines& lines, const CPaint& paint);

}  // namespace brindle
