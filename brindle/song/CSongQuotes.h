// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSongModel.h"

#include <cstdint>
#include <span>
#include <vector>

namespace brindle {

/// A passage that stands just so in a song of a model: the same chords with the same lengths,
/// whatever the key.
struct CSongQuote {
    /// An index of CSongModel::Songs(); -1 for no quote.
    std::int32_t mSong = -1;
    /// Where it begins there, in ticks from the first bar line.
    std::int32_t mSourceTick = 0;
    /// Where it begins in what was written, in ticks from its first chord.
    std::int32_t mTick = 0;
    /// In ticks; 0 for no quote.
    std::int32_t mLength = 0;
};

/// A chord of what is written.
struct CQuotedChord {
    std::int32_t mId = -1;     ///< its number in the model; -1 for one that it has not heard
    std::int32_t mLength = 0;  ///< in ticks
};

/// Follows a row of chords through all songs at once: which places of the songs its end is like,
/// and how far back. A step takes as long as the chord was heard often.
class CSongQuotes {
public:
    /// The model must outlive it.
    explicit CSongQuotes(const CSongModel& model) : mModel(&model) {}

    /// Goes on by one chord.
    void Add(const CQuotedChord& chord);
    /// The longest run, in ticks, that stands in one song and ends with `chord` if it is added now.
    [[nodiscard]] std::int32_t LengthWith(const CQuotedChord& chord) const;

private:
    friend CSongQuote LongestQuote(const CSongModel& model, std::span<const CQuotedChord> chords);

    /// An end of what was added that stands in a song.
    struct CMatch {
        std::uint32_t mPlace;
        std::int32_t mLength;
    };

    [[nodiscard]] bool GoesOn(const CMatch& match, const CQuotedChord& chord) const;

    const CSongModel* mModel;
    /// By place.
    std::vector<CMatch> mMatches;
};

/// The longest passage that stands in one song.
[[nodiscard]] CSongQuote LongestQuote(const CSongModel& model,
                                      std::span<const CQuotedChord> chords);

}  // namespace brindle
