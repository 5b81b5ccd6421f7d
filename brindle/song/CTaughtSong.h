// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CRelativeChord.h"
#include "brindle/song/CSong.h"

#include <cstdint>
#include <string>
#include <vector>

namespace brindle {

/// A bar of any metre has so many ticks: halves, thirds, quarters and eighths of it are whole.
inline constexpr std::int32_t kTicksPerBar = 24;
/// Where in its bar a tick lies, 0 to kTicksPerBar - 1; an upbeat has ticks below 0.
[[nodiscard]] constexpr std::int32_t TickInBar(std::int32_t tick) {
    return (tick % kTicksPerBar + kTicksPerBar) % kTicksPerBar;
}

/// A chord of a song with its place in the bars.
struct CTaughtChord {
    CRelativeChord mChord;  ///< in the key of its passage
    /// In ticks from the first bar line; an upbeat is before it.
    std::int32_t mBegin = 0;
    std::int32_t mLength = 0;  ///< in ticks
    /// The last chord of a part of the song, or of the song.
    bool mEndsSection = false;

    friend bool operator==(const CTaughtChord&, const CTaughtChord&) = default;
};

/// A song as a model learns it: relative to its keys, in ticks of its bars, equal neighbours as one
/// chord.
struct CTaughtSong {
    std::string mTitle;  ///< may be empty
    std::string mStyle;  ///< as its source calls it; may be empty
    /// That it was written in.
    CSignKeyLite mKey;
    double mBeatsPerBar = 4.0;          ///< of the song; ticks count bars of any length
    std::vector<CTaughtChord> mChords;  ///< by time

    friend bool operator==(const CTaughtSong&, const CTaughtSong&) = default;
};

/// Reads the keys of a song and writes each chord relative to that of its passage. Where no chord
/// sounds the one before is held. A song without parts has one for each eight bars. Without chords
/// for a song without them.
[[nodiscard]] CTaughtSong TeachSong(const CSong& song);

/// The chords of a taught song as they were, each in its key.
[[nodiscard]] std::vector<CChordLite> WrittenChordsOf(const CTaughtSong& song);

/// The same song as if it were in C major throughout: what a model learns that knows no keys.
[[nodiscard]] CTaughtSong WithoutKeys(const CTaughtSong& song);

}  // namespace brindle
