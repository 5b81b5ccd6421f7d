// SPDX-License-Identifier: MIT
// What a model counts in its songs: how often chords stand where, and what follows them.

#include "brindle/song/CSongModel.h"

#include <algorithm>
#include <cmath>
#include <tuple>

namespace brindle {
namespace {

/// A chord of a song at a place of the bar.
struct CHeard {
    std::int32_t mId;
    std::int32_t mSong;
    TBarPlace mBarPlace;
};

CHeard HeardAt(const CSongModel::CPlace& place) {
    return {place.mId, place.mSong, place.mBarPlace};
}

/// Adds up what was heard, song by song, in ascending order of chords.
template <typename TSharesOf>
void ShareHeard(std::vector<CHeard>& heard, const TSharesOf& sharesOf) {
    const auto songOf = [](const CHeard& chord) { return std::pair(chord.mId, chord.mSong); };
    std::sort(heard.begin(), heard.end(),
              [&](const CHeard& a, const CHeard& b) { return songOf(a) < songOf(b); });
    for (std::size_t begin = 0; begin < heard.size();) {
        std::array<std::uint32_t, kBarPlaceCount> times{};
        std::size_t end = begin;
        for (; end < heard.size() && songOf(heard[end]) == songOf(heard[begin]); ++end) {
            ++times[heard[end].mBarPlace];
        }
        sharesOf(heard[begin].mId).AddSong(times);
        begin = end;
    }
}

}  // namespace

void CSongModel::CountPlaces() {
    mCounts.assign(mVocabulary.size(), 0);
    for (const CPlace& place : mPlaces) {
        if (place.mId >= 0) ++mCounts[static_cast<std::size_t>(place.mId)];
    }
    mEndCounts.assign(mVocabulary.size(), 0);
    mFinalCounts.assign(mVocabulary.size(), 0);
    std::size_t place = 0;
    for (const CTaughtSong& song : mSongs) {
        ++place;
        for (const CTaughtChord& chord : song.mChords) {
            const CPlace& at = mPlaces[place++];
            mEndCounts[static_cast<std::size_t>(at.mId)] += chord.mEndsSection;
            ++mPlaceCounts[at.mBarPlace];
            mRestCounts[at.mBarPlace] += chord.mEndsSection && chord.mChord.mRoot == 0;
        }
        ++mFinalCounts[static_cast<std::size_t>(mPlaces[place - 1].mId)];
    }
}

void CSongModel::ShareTriples() {
    mTripleShares.resize(mPlaces.size());
    using TTriple = std::array<std::int32_t, 3>;
    const auto tripleAt = [this](std::size_t place) {
        return TTriple{IdAhead(place, 2), IdAhead(place, 1), mPlaces[place].mId};
    };
    std::vector<TTriple> triples;
    for (std::size_t begin = 0; begin < mPlaces.size();) {
        // What stands before the song, and its chords.
        const std::size_t end =
            begin + 1 + mSongs[static_cast<std::size_t>(mPlaces[begin].mSong)].mChords.size();
        triples.clear();
        for (std::size_t place = begin; place < end; ++place) triples.push_back(tripleAt(place));
        std::sort(triples.begin(), triples.end());
        for (std::size_t place = begin; place < end; ++place) {
            const auto [first, last] =
                std::equal_range(triples.begin(), triples.end(), tripleAt(place));
            mTripleShares[place] = 1.0F / std::sqrt(static_cast<float>(last - first));
        }
        begin = end;
    }
}

void CSongModel::CountSuccessors() {
    mSuccessorBegins.assign(1, 0);
    std::vector<CHeard> heard;
    const auto count = static_cast<std::int32_t>(mVocabulary.size());
    // In the order of SuccessorsOf: both starts, then the chords.
    for (std::int32_t id = -3; id < count; ++id) {
        if (id == -1) continue;
        const CRange range = Narrowed({0, mByHistory.size()}, id, 1);
        heard.clear();
        for (std::size_t ix = range.mBegin; ix < range.mEnd; ++ix) {
            heard.push_back(HeardAt(mPlaces[mByHistory[ix]]));
        }
        ShareHeard(heard, [&](std::int32_t next) -> CSongShares& {
            const bool isNew =
                mSuccessors.size() == mSuccessorBegins.back() || mSuccessors.back().mId != next;
            if (isNew) mSuccessors.push_back({next, {}});
            return mSuccessors.back().mShares;
        });
        mSuccessorBegins.push_back(mSuccessors.size());
    }
}

/// The shares of each chord of the chords that `isCounted` takes, by their places.
template <typename TIsCounted>
std::vector<CSongShares> CSongModel::SharesOfChords(const TIsCounted& isCounted) const {
    std::vector<CHeard> heard;
    for (const std::uint32_t place : mByHistory) {
        if (isCounted(place)) heard.push_back(HeardAt(mPlaces[place]));
    }
    std::vector<CSongShares> shares(mVocabulary.size());
    ShareHeard(heard, [&](std::int32_t id) -> CSongShares& {
        return shares[static_cast<std::size_t>(id)];
    });
    return shares;
}

void CSongModel::ShareChords() {
    mChordShares = SharesOfChords([](std::size_t) { return true; });
    for (const bool isMinor : {false, true}) {
        mModeShares[isMinor] = SharesOfChords(
            [&](std::size_t place) { return IsInMinor(mPlaces[place - 1].mId) == isMinor; });
    }
}

void CSongModel::CountLengths() {
    std::map<std::array<std::int32_t, 3>, std::map<std::int32_t, std::uint32_t>> counts;
    for (const CTaughtSong& song : mSongs) {
        const auto beats = static_cast<std::int32_t>(std::lround(song.mBeatsPerBar));
        std::int32_t before = 0;
        for (const CTaughtChord& chord : song.mChords) {
            const std::int32_t tick = TickInBar(chord.mBegin);
            ++counts[{beats, tick, 0}][chord.mLength];
            if (before != 0) ++counts[{beats, tick, before}][chord.mLength];
            before = chord.mLength;
        }
    }
    for (const auto& [key, lengths] : counts) mLengths[key].assign(lengths.begin(), lengths.end());
}

}  // namespace brindle
