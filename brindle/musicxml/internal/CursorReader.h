// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/internal/ScoreElements.h"
#include "brindle/musicxml/internal/WrittenScore.h"

#include <string_view>

namespace brindle {

/// Follows the time inside a measure: notes, moves and the units in which they are counted.
class CCursorReader {
public:
    /// Reads into the last measure of the part, which is there already.
    explicit CCursorReader(CScorePart& part) : mPart(part) {}

    void Started(TScoreElement element);
    void Ended(TScoreElement element, TScoreElement parent, std::string_view text);

    [[nodiscard]] TTicks Cursor() const { return mCursor; }
    [[nodiscard]] TTicks TicksOf(double duration) const;

private:
    void Move(TTicks ticks);
    void EndedDivisions(std::string_view text);

    CScorePart& mPart;
    TTicks mCursor = 0;
    double mDuration = 0.0;  // of the note or the move that is being read
    bool mTakesTime = true;
};

}  // namespace brindle
