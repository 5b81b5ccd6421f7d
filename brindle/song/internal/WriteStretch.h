// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/SeededRandom.h"
#include "brindle/song/internal/SongStretch.h"

#include <vector>

namespace brindle {

enum TStretchEnd : std::uint8_t {
    TStretch_Written,
    TStretch_Impossible,  ///< the wishes contradict each other
    TStretch_Quoted,      ///< no way was found that quotes no more than it may
};

/// Writes a stretch: draws chord by chord and length by length, each by the longest history that
/// the model knows and by how well the stretch can be finished then. `chords` is what was written.
///
/// Only the limit of quotes can end a way. Then the last choice is taken back and made anew without
/// what was tried, up to a number of steps.
[[nodiscard]] TStretchEnd WriteStretch(const CSongModel& model, const CSongStretch& stretch,
                                       SeededRandom& random, std::vector<CWrittenChord>& chords);

/// Whether there is any way through the stretch, quoted or not.
[[nodiscard]] bool IsStretchPossible(const CSongModel& model, const CSongStretch& stretch);

}  // namespace brindle
