// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CBars.h"
#include "brindle/song/CSong.h"

#include <cstddef>
#include <string>
#include <vector>

namespace brindle {

/// A bar of a song and the chords that begin in it, or a long row of bars in which none does.
struct CReadingBar {
    /// Counted from 1, as played.
    long mNumber = 1;
    long mCount = 1;
    /// The chords [mBegin, mEnd) of the song.
    std::size_t mBegin = 0;
    std::size_t mEnd = 0;

    [[nodiscard]] bool HasChords() const { return mBegin < mEnd; }
};

/// How the bars of a song are counted.
[[nodiscard]] CBars BarsOfSong(const CSong& song);

/// From the first bar to the one in which the last chord ends. What has no place in time is left
/// out.
[[nodiscard]] std::vector<CReadingBar> ReadingBarsOf(const CSong& song, const CBars& bars);

/// The number of chords without the end marker.
[[nodiscard]] std::size_t ChordCountOf(const CSong& song);

/// Bars that are the same as earlier ones.
struct CRepeatedBars {
    /// Numbers of bars.
    long mFirst = 1;
    long mSource = 1;
    long mCount = 0;
};

/// The longest passages of whole bars that repeat earlier ones, each of the earliest source; in the
/// order of time, without overlaps. Bars of only one chord are no passage, nor are short ones:
/// under four bars, in a longer song under an eighth of it, up to eight. n log n.
[[nodiscard]] std::vector<CRepeatedBars> RepeatedBarsOf(
    const CSong& song, const CBars& bars, const std::vector<CReadingBar>& readingBars);

/// The same with passages from `shortest` bars on; a single bar is one if it has several chords.
[[nodiscard]] std::vector<CRepeatedBars> RepeatedBarsOf(const CSong& song, const CBars& bars,
                                                        const std::vector<CReadingBar>& readingBars,
                                                        std::size_t shortest);

/// "bars 13 to 21 repeat bars 1 to 9".
[[nodiscard]] std::string RepeatText(const CRepeatedBars& repeat);

}  // namespace brindle
