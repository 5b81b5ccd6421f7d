// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/guitarchords/FindFingerings.h"

#include <cstddef>
#include <span>
#include <vector>

namespace brindle {

/// How fingerings of a song are chosen.
struct CSongFingeringOptions {
    /// What each chord may be; mCapo is the fret of the capodaster of ChooseFingerings.
    CFingeringOptions mFingering;
    /// So many fingerings of each chord are weighed, 1 to 32.
    std::size_t mCandidates = 8;
    /// The last fret of a capodaster that CompareCapos tries, 0 to 12.
    int mHighestCapo = 7;
};

/// A song as it lies under the hand.
struct CSongFingerings {
    int mCapo = 0;  ///< the fret of the capodaster, 0 for none
    /// Of each chord; without strings where there is no chord, and for a chord that cannot be held.
    std::vector<CFingering> mFingerings;
    /// Chords that cannot be held.
    std::size_t mHoles = 0;
    /// Mean over all changes, that of the capodaster included: less is easier.
    int mCost = 0;
    /// Mean difficulty of the chords that are held, 0 to 9.
    double mDifficulty = 0.0;
};

/// The fingering of each chord of a song: those that are easy by themselves and near each other.
/// It is the cheapest path through the best fingerings of each chord; a step costs what the
/// fingering costs, the way of the hand along the neck, and the fingers that are put down anew. A
/// chord that cannot be held within the options is tried with a wider hand and without its root.
/// The work grows with the number of chords alone, and each different chord is searched once.
[[nodiscard]] CSongFingerings ChooseFingerings(std::span<const CChordLite> chords,
                                               const GChShortTuning& tuning,
                                               const CSongFingeringOptions& options = {});

/// The same without a capodaster and with one on each fret, the easiest first.
[[nodiscard]] std::vector<CSongFingerings> CompareCapos(std::span<const CChordLite> chords,
                                                        const GChShortTuning& tuning,
                                                        const CSongFingeringOptions& options = {});

/// What a hand plays under a capodaster so that the chords sound: G for Bb at fret 3. All move by
/// one interval, that with the fewest signs, so that C and E7 at fret 3 are A and C#7.
[[nodiscard]] std::vector<CChordLite> ShapesUnderCapo(std::span<const CChordLite> chords, int capo);

/// The same for one chord.
[[nodiscard]] CChordLite ShapeUnderCapo(const CChordLite& chord, int capo);

}  // namespace brindle
