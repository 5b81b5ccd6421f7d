// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/internal/PlayMarks.h"
#include "brindle/song/internal/SongTokens.h"

#include <cstddef>
#include <vector>

namespace brindle::SongText {

/// A bar as it is written, or a passage of a text without bar lines. It has chords or holds.
struct CWrittenBar {
    /// Tokens, of which chords, holds, keys and sections count.
    std::size_t mBegin = 0;
    std::size_t mEnd = 0;
    /// It ends at a bar line, and not where its last chord does.
    bool mIsClosed = false;
    /// It stands for a bar before it, whose tokens it has.
    bool mIsCopy = false;
    /// Undefined where the preferences tell the length of a bar.
    CSongTime mTime;
};

struct CSheetBars {
    std::vector<CWrittenBar> mBars;
    /// Of each bar.
    std::vector<CPlayMarks> mMarks;
};

/// Collects the tokens between bar lines. A repeat of bars that are not there is a fault of `list`,
/// and words that lead nowhere are a note of it.
[[nodiscard]] CSheetBars MakeSheetBars(CTokenList& list);

}  // namespace brindle::SongText
