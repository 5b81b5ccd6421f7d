// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSongModel.h"

#include <cstdint>
#include <span>
#include <vector>

namespace brindle {

/// A passage of two chords or more that stands just so in a song of a model: the same chords with
/// the same lengths, in whatever key and however that is read.
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
    CSoundingChord mChord;  ///< as it sounds
    /// Somebody else chose just this chord: a passage of such chords alone is no quote of ours.
    bool mIsWished = false;
};

/// Follows a row of chords through all songs at once: which places of the songs its end is like,
/// and how far back. A step takes as long as the chord was heard often behind the one before.
class CSongQuotes {
public:
    /// The model must outlive it.
    explicit CSongQuotes(const CSongModel& model) : mModel(&model) {}

    /// Goes on by one chord. Equal neighbours have to be added as one, as songs are learned.
    void Add(const CQuotedChord& chord);
    /// The longest run, in ticks, that stands in one song, ends with what was added last and has a
    /// chord that was not wished for; 0 for none.
    [[nodiscard]] std::int32_t Length() const;

private:
    friend CSongQuote LongestQuote(const CSongModel& model, std::span<const CQuotedChord> chords);

    /// An end of what was added that stands in a song.
    struct CMatch {
        std::uint32_t mPlace;
        std::int32_t mLength;
    };

    const CSongModel* mModel;
    CSoundingChord mLast;
    /// The ticks of the chords at the end that were wished for.
    std::int32_t mWished = 0;
    /// By place.
    std::vector<CMatch> mMatches;
};

/// The longest passage that stands in one song, of all chords, wished for or not. Equal neighbours
/// have to be one chord.
[[nodiscard]] CSongQuote LongestQuote(const CSongModel& model,
                                      std::span<const CQuotedChord> chords);
/// Whether a passage with a chord that was not wished for is longer than so many ticks.
[[nodiscard]] bool QuotesMoreThan(std::int32_t ticks, const CSongModel& model,
                                  std::span<const CQuotedChord> chords);

}  // namespace brindle
