// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/internal/SheetLines.h"
#include "brindle/present/internal/SheetLinks.h"

#include <cstddef>
#include <vector>

namespace brindle::LeadSheet {

/// The part of a link that stands on one line: an arrow above the chords, a bracket below them.
struct CLinkMark {
    double mBegin = 0.0;
    double mEnd = 0.0;
    /// It comes from the line before, or goes on on the next.
    bool mIsFromBefore = false;
    bool mGoesOn = false;
    /// It ends at a repeat sign.
    bool mGoesBack = false;
    bool mIsDotted = false;
    /// Arrows that would cross each other are one above the other: 0 is the lowest.
    std::size_t mLevel = 0;
};

/// A passage of a line in one key.
struct CKeyMark {
    double mBegin = 0.0;
    double mEnd = 0.0;
    CSignKeyLite mKey;
    /// The key begins here and is named.
    bool mIsNew = false;
};

struct CLineMarks {
    std::vector<CLinkMark> mArrows;
    std::vector<CLinkMark> mBrackets;
    std::vector<CKeyMark> mKeys;

    /// How many arrows stand one above the other.
    [[nodiscard]] std::size_t Levels() const;
};

/// What is drawn over the chords of each line.
[[nodiscard]] std::vector<CLineMarks> MakeMarks(const CSheetLines& lines,
                                                const std::vector<CChordTexts>& texts,
                                                const CSongReading& reading,
                                                const CSheetLinks& links);

}  // namespace brindle::LeadSheet
