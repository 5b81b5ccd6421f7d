// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSongModel.h"
#include "brindle/song/CSongQuotes.h"
#include "brindle/song/SongWishes.h"

#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace brindle {

/// A chord of a song that is being written.
struct CWrittenChord {
    CRelativeChord mChord;
    /// Its number in the model; -1 for one that was only wished for.
    std::int32_t mId = -1;
    /// The tonic of its key above that of the song, 0 to 11.
    std::int32_t mTonic = 0;
    std::int32_t mBeats = 0;
    /// Just this chord was wished for, on all of its beats.
    bool mIsWished = false;
};

/// A part of a song that is to be written in one go, and all that is known of it.
struct CSongStretch {
    CSignKeyLite mHome;
    std::int32_t mBeatsPerBar = 4;
    std::size_t mBeats = 0;
    /// Where it begins in its section, which tells the place of its bars among four.
    std::size_t mFirstBeat = 0;
    /// What was written before it.
    std::vector<CWrittenChord> mBefore;
    /// What is already written behind it.
    std::vector<CWrittenChord> mBehind;
    /// Of each beat, what has to sound there.
    std::vector<std::vector<CWishedChord>> mWishes;
    std::vector<CWishedChord> mNever;
    std::vector<std::vector<CWishedChord>> mContains;
    bool mEndsOnTonic = false;
    /// The first of two parts of one letter, which rather does not.
    bool mStaysOpen = false;
    /// A part ends with it.
    bool mEndsSection = false;
    std::size_t mOrder = CSongModel::kLongestHistory;
    /// The longest run, in ticks, that may stand in one song; 0 for any.
    std::int32_t mMostQuoted = 0;
};

}  // namespace brindle
