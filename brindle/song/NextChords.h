// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/song/CSongModel.h"

#include <cstddef>
#include <span>
#include <string>
#include <vector>

namespace brindle {

/// A chord that may come next.
struct CNextChord {
    /// Spelled as in the key.
    CChordLite mChord;
    /// Of all chords that may come, 0 to 1.
    double mProbability = 0.0;
    /// What it is behind the chords before in the key that all are told in, "V7/ii".
    std::string mNumeral;
    THarmFunction mFunction = THarmFunction_Undef;  ///< what it does there
};

/// What is asked of NextChords.
struct CNextChordOptions {
    /// The key that the chords are in; undefined to find it.
    CSignKeyLite mKey;
    std::size_t mCount = 10;  ///< most chords that are wanted
    /// Where the next chord begins.
    TBarPlace mPlace = TBarPlace_Bar1;
    std::size_t mOrder = CSongModel::kLongestHistory;  ///< chords before that are looked at
};

/// What may come, and the key in which that is said.
struct CNextChords {
    /// That of the chords; undefined without a chord and a key.
    CSignKeyLite mKey;
    /// The likeliest first.
    std::vector<CNextChord> mChords;
};

/// Ranks what may come behind chords; without chords, what a song in the key begins with. Only the
/// last chords count: a call takes as long however long the song is. A page may call it at every
/// key stroke; a model may be asked by several threads.
[[nodiscard]] CNextChords NextChords(const CSongModel& model, std::span<const CChordLite> chords,
                                     const CNextChordOptions& options = {});

}  // namespace brindle
