// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSong.h"

#include <cstddef>
#include <string>
#include <vector>

/// What is written on a lead sheet, before it is laid out.
namespace brindle::LeadSheet {

/// Positions that differ by less are the same.
inline constexpr double kTolerance = 1e-6;

inline constexpr std::size_t kNone = static_cast<std::size_t>(-1);

/// A bar that is drawn, or some bars without a chord that are drawn as one rest.
struct CSheetBar {
    std::string mNumber;
    double mPosition = 0.0;
    double mLength = 0.0;
    std::size_t mBarCount = 1;
    /// The chords [mBegin, mEnd) of the song begin in it.
    std::size_t mBegin = 0;
    std::size_t mEnd = 0;
    /// The chord that sounds on where a part begins, so that it is written anew; `kNone` elsewhere.
    std::size_t mHeld = kNone;
    /// Shorter than a bar, at the begin of the song.
    bool mIsUpbeat = false;
    /// Told where it begins to hold.
    CSongTime mTime;

    bool mBeginsSection = false;
    std::string mSection;

    bool mBeginsRepeat = false;
    bool mEndsRepeat = false;
    /// How often a passage without endings is played that ends here.
    std::size_t mTimes = 1;
    /// "1.", "2. 3."; of the first bar of an ending.
    std::string mEnding;
    /// The bar lies under the bracket of an ending.
    bool mIsInEnding = false;
    bool mClosesEnding = false;
    /// "= bars 1-8": what stands elsewhere is played again, and no sign says so.
    std::string mRemark;
    /// Where jumps lead to, and at the end of the bar the words for them.
    TSongSign mSign = TSongSign_None;
    std::string mWords;
    /// As in the song, both.
    std::size_t mWritten = CSongBar::kNotWritten;
    bool mEndsEnding = false;
};

struct CSheet {
    std::vector<CSheetBar> mBars;
    /// Of each chord of the song the one that is drawn for it: itself, or the same one of the first
    /// time that a repeated passage is played.
    std::vector<std::size_t> mDrawnAs;
    /// Of each chord of the song, ascending and finite.
    std::vector<double> mPositions;
};

/// A passage that is repeated at once is written once, with its endings, and so is what a written
/// jump plays again; any other passage that is played again is written out, with a remark. Linear
/// in bars and chords.
[[nodiscard]] CSheet MakeSheet(const CSong& song);

/// The number of chords without the end marker.
[[nodiscard]] std::size_t CountChords(const CSong& song);

}  // namespace brindle::LeadSheet
