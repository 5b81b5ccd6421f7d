// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/ScoreNotes.h"

#include <array>
#include <vector>

namespace brindle {

/// What sounds in a stretch of time.
struct CNoteWindow {
    double mPosition = 0.0;
    double mEndPosition = 0.0;
    /// The beat that begins it ends here; its lowest note is the bass.
    double mFirstBeatEnd = 0.0;
    /// How long each key sounds, of all keys together: they add up to 1, or to 0 in silence.
    std::array<double, 12> mShares{};
    /// -1 in silence.
    std::int64_t mBass = -1;
    /// The spellings of the keys, of several the one that sounds last; undefined without one.
    std::array<TEnh, 12> mSpellings{};

    [[nodiscard]] bool IsSilent() const { return mBass < 0; }
};

/// The bars or the beats of a score with what sounds in them.
[[nodiscard]] std::vector<CNoteWindow> NoteWindows(const CScoreNotes& score, bool areBeats);

}  // namespace brindle
