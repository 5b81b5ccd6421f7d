// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSongModel.h"

#include <cstddef>
#include <span>
#include <vector>

namespace brindle {

/// How well chords are foretold.
struct CSongScore {
    std::size_t mChords = 0;  ///< that were foretold
    /// Sum over the chords; the key of a song counts log2 24 once, where chords are told by it.
    double mBits = 0.0;

    /// The cross entropy; 0 without chords.
    [[nodiscard]] double BitsPerChord() const;
};

/// The bits that a model of so many chords of history needs for each song: the binary logarithm of
/// one over the probability of each chord, changes of key among them, by interpolation.
///
/// Songs that the model has learned are foretold by a model without them: they are left out in ten
/// groups at most, each with a model of the other songs. `withKeys` false forgets the keys of the
/// model and of the songs, so that all chords are absolute.
[[nodiscard]] std::vector<CSongScore> ScoreSongs(const CSongModel& model,
                                                 std::span<const CTaughtSong> songs,
                                                 std::size_t order, bool withKeys = true);

/// All of them together.
[[nodiscard]] CSongScore SumOfScores(std::span<const CSongScore> scores);

/// How well songs are foretold by histories of one length.
struct COrderScores {
    std::size_t mOrder = 0;   ///< chords of history, from 1
    CSongScore mWithKeys;     ///< chords told relative to their keys
    CSongScore mWithoutKeys;  ///< all chords absolute
};

/// All songs together for each length of histories, from 1 to that of models.
[[nodiscard]] std::vector<COrderScores> ScoresByOrder(const CSongModel& model,
                                                      std::span<const CTaughtSong> songs);

}  // namespace brindle
