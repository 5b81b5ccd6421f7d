// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/Positions.h"
#include "brindle/theory/CSignKeyLite.h"

#include <array>
#include <cstddef>
#include <vector>

namespace brindle {

class CHarmAnlsChords;

/// How FindKeys weighs. A value that is not a number, or that makes no sense, counts as the
/// default.
struct CKeyOptions {
    double mBeatsPerBar = 4.0;  ///< the length of a bar, above 0
    /// What a chord gains in the key of the song. More keeps passages at home.
    double mHomeBonus = 0.4;
    /// What the nearest change of key costs, not less than 0. More makes longer regions.
    double mChangeCost = 4.0;
};

/// A passage of a song in one key.
struct CKeyRegion {
    CSignKeyLite mKey;  ///< the key of the passage
    /// Number of its first chord in the list, from 0.
    std::size_t mBegin = 0;
    /// One behind the last one.
    std::size_t mEnd = 0;
    /// Where it begins, in beats.
    double mPosition = kPosUndef;
    /// Where it ends, in beats: where the next one begins or the song ends.
    double mEndPosition = kPosUndef;
};

/// The key of a song and the keys that it passes through.
struct CKeyOfSong {
    /// Undefined for a song without chords.
    CSignKeyLite mKey;
    /// How sure the key is against the 23 others, 0 to 1; `kPosUndef` without a key.
    double mConfidence = kPosUndef;
    /// The points of each key: C major to B major, C minor to B minor.
    std::array<double, 24> mScores{};
    /// In the order of time, without a gap between them.
    std::vector<CKeyRegion> mRegions;
};

/// Finds the key of a song and its local keys from what sounds how long, from the first and the
/// last chord and from the steps between the chords. `chords` are as a chord text gives them: by
/// position, an undefined chord at the end. One pass, linear in the number of chords.
///
/// A chord that is the same as the one before makes that one longer, and so does an undefined one.
/// Keys are spelled with the least signs; where two spellings have as many, as the chords are.
[[nodiscard]] CKeyOfSong FindKeys(const CHarmAnlsChords& chords, const CKeyOptions& options = {});

}  // namespace brindle
