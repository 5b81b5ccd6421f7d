// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSong.h"
#include "brindle/song/CSongModel.h"
#include "brindle/song/SongWishes.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace brindle {

inline constexpr std::size_t kMostWrittenBars = 256;  ///< of a song that is written
inline constexpr int kMostWrittenBeatsPerBar = 24;    ///< of its bars
inline constexpr double kLongestQuoteLimit = 1000.0;  ///< bars, beyond any song

/// What song is to be written.
struct CWriteSongOptions {
    CSignKeyLite mKey{{0, TEnh_n}, TSignKeyType_Major};  ///< of the song; its parts may leave it
    /// One letter for each part, "AABA": parts of one letter are the same up to their endings.
    /// Empty for a song of one part.
    std::string mForm;
    /// 1 to 256, the same number for each part.
    std::size_t mBars = 32;
    /// 1 to 24.
    int mBeatsPerBar = 4;
    std::vector<CSongWish> mWishes;  ///< all of them are met, or there is no song
    /// The longest passage that may stand just so in a song of the model; 0 for any.
    double mMostQuotedBars = 4.0;
    /// Chords of history that are asked for, 1 to CSongModel::kLongestHistory.
    std::size_t mOrder = CSongModel::kLongestHistory;
    /// Whether the song ends on its tonic; a wish for another end goes before it.
    bool mEndsOnTonic = true;
    /// The same seed writes the same song.
    std::uint64_t mSeed = 0;
};

/// Which of the numbers is out of its range, a line for people; empty if none is.
[[nodiscard]] std::string RangeFaultOf(const CWriteSongOptions& options);

/// A passage of a written song that stands just so, in whatever key, in a song of the model.
struct CWrittenQuote {
    /// Of the song it stands in; empty for a song without a title.
    std::string mTitle;
    /// Where it stands there, in bars from 1, also within a bar.
    double mSourceBar = 0.0;
    /// Where it stands in the written song, likewise.
    double mBar = 0.0;
    /// How many bars it has, also parts of one; 0 for no quote.
    double mBars = 0.0;
};

/// A song that was written, or why there is none.
struct CWrittenSong {
    /// With its parts, and with the parts that repeat the one before them. Without chords if there
    /// is a fault.
    CSong mSong;
    CWrittenQuote mLongestQuote;  ///< of all that stand in it
    /// A smallest set of wishes that cannot be met together, as they were typed.
    std::vector<std::string> mContradiction;
    /// Empty if the song was written.
    std::string mFault;
};

/// Writes a song in the manner of a model that meets all wishes. Each part is drawn at once, from
/// its first chord to its last, so that no way is given up but for the limit of quotes. Time grows
/// with the bars, with the common chords of the model (400 at most) and with the chords of wishes
/// to contain a row.
[[nodiscard]] CWrittenSong WriteSong(const CSongModel& model, const CWriteSongOptions& options);

}  // namespace brindle
