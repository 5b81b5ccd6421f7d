// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/platform/WorkInParallel.h"
#include "brindle/song/SplitSongs.h"

#include <cstddef>
#include <functional>
#include <optional>
#include <string>

namespace brindle {

/// One of many songs, and where it comes from.
struct CSourceOfSong {
    /// The file, as it is to be told.
    std::string mPath;
    /// The file inside, if that is an archive; empty for none.
    std::string mMember;
    /// Of the songs in the file, from 1, and how many there are.
    std::size_t mNumber = 1;
    std::size_t mCount = 1;  ///< songs in the file
    CUnreadSong mSong;       ///< read by the thread that analyses it
    /// Why there is no song to read; empty if there is one.
    std::string mFault;
};

/// The analysis of a song as JSON on one line.
struct CSongLine {
    /// With its end of line; see docs/corpus.md.
    std::string mText;
    /// Whether the line tells a fault and has no analysis.
    bool mHasFault = false;
};

/// A song of more chords is no song but a mistake, and is at fault.
inline constexpr std::size_t kMostChordsOfLine = 100'000;

/// Reads and analyses the song.
[[nodiscard]] CSongLine SongLine(const CSourceOfSong& source, const CReadingOptions& options = {});

/// Where the songs come from and where their lines go; all is called on one thread.
struct CSongLineSteps {
    /// The next song; nothing at the end.
    std::function<std::optional<CSourceOfSong>()> mNext;
    /// Takes a line; false to end.
    std::function<bool(CSongLine&&)> mTake;
    /// Called several times a second; false to end. May be empty.
    std::function<bool()> mPulse;
};

/// Writes the lines of many songs, on all cores, with memory for those in work.
void WriteSongLines(const CSongLineSteps& steps, const CParallelOptions& parallel = {},
                    const CReadingOptions& options = {});

}  // namespace brindle
