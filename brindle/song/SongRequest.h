// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/WriteSong.h"

#include <cstddef>
#include <string>

namespace brindle {

/// A song as somebody asks for it, in words. Empty texts ask for nothing.
struct CSongRequest {
    CSignKeyLite mKey{{0, TEnh_n}, TSignKeyType_Major};  ///< of the song
    /// A letter for each part, "AABA" or "a a b a", or "blues"; AABA for 32 bars.
    std::string mForm;
    /// 0 for those of the sheet, or for the usual ones: 12 for a blues, which may have more times
    /// twelve, and else 32.
    std::size_t mBars = 0;
    int mBeatsPerBar = 4;   ///< 1 to 24
    std::string mSheet;     ///< see ReadSheetWishes
    std::string mBegins;    ///< the first chord, or its numeral
    std::string mEnds;      ///< the last chord, or its numeral
    std::string mContains;  ///< rows of chords as ReadChordsWish reads them, between ;
    std::string mNever;     ///< chords or numerals
};

/// What WriteSong has to do for a request, or what is wrong with it.
struct CSongRequestReading {
    /// With the wishes, which tell where they come from: "begins Am", "sheet C in bar 1". What a
    /// request does not tell is as usual.
    CWriteSongOptions mOptions;
    /// Whose songs it should be written after if nobody says otherwise and there are any: "blues"
    /// for a blues. Empty for all.
    std::string mStyle;
    /// A line for people that begins with the name of what is wrong: "begins: X is neither a chord
    /// nor a numeral". Empty if all is understood.
    std::string mFault;
};

/// Reads a request. Whether its wishes can be met, and whether its bars share the parts of its
/// form, tells WriteSong.
[[nodiscard]] CSongRequestReading ReadSongRequest(const CSongRequest& request);

/// Writes what was read, after the songs of its style where the model has any. What is wrong with
/// the request is wrong with the song.
[[nodiscard]] CWrittenSong WriteRequestedSong(const CSongModel& model,
                                              const CSongRequestReading& request);

}  // namespace brindle
