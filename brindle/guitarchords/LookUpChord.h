// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/guitarchords/GChDatabase.h"

#include <memory>
#include <optional>
#include <span>
#include <vector>

namespace brindle {

/// A fingering of a library for a chord that somebody asked for.
struct CFoundGrid {
    std::shared_ptr<GChBasicChord> mGrid;  ///< as the library has it; never null
    /// Tones of the chord that it leaves out, above the root.
    CSemitones mOmitted;
    /// Its place in the order of a player, as CFingering has it: less is better.
    int mCost = 0;
};

/// What pitches leave out of a chord; nothing if they sound another one, lack more than players
/// leave out, or have another bass than the one behind its slash. Negative pitches do not sound.
[[nodiscard]] std::optional<CSemitones> TonesLeftOut(std::span<const int> pitches,
                                                     const CChordLite& chord);

/// The fingerings of a tuning that stand over the root of the chord and sound it under the
/// capodaster, in the order of FindFingerings: low ones with open strings first. A chord without a
/// slash is not found where a library tells a bass. The tuning counts up to whole octaves.
[[nodiscard]] std::vector<CFoundGrid> LookUpChord(const GChDatabase& database,
                                                  const CChordLite& chord,
                                                  const GChShortTuning& tuning, int capo);

}  // namespace brindle
