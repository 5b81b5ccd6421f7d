// SPDX-License-Identifier: MIT
// The two orders of all places in the songs: by the chords that stand before them, in their keys,
// and by how a place and the one before it sound, in whatever key.

#include "brindle/song/CSongModel.h"

#include "brindle/theory/KeyIntervals.h"

#include <algorithm>

namespace brindle {
namespace {

/// How a chord and the one before it sound, in whatever key. Longer chords than 2^14 ticks, more
/// than 600 bars, are all alike.
std::uint64_t PairNumber(const CSoundingChord& before, const CSoundingChord& chord) {
    const auto word = [](const CSoundingChord& one) {
        return std::uint64_t{one.mMask} | std::uint64_t{one.mBass} << 12U |
               static_cast<std::uint64_t>(std::min(one.mLength, 0x3FFF)) << 16U;
    };
    const int step = FoldIntoOctave(chord.mRoot - before.mRoot);
    return word(before) << 34U | word(chord) << 4U | static_cast<std::uint64_t>(step);
}

}  // namespace

/// The chord `back` places before a place; that before the start of a song is -1.
std::int32_t CSongModel::IdAhead(std::size_t place, std::size_t back) const {
    return place < back || mPlaces[place - back].mSong != mPlaces[place].mSong
               ? -1
               : mPlaces[place - back].mId;
}

void CSongModel::SortHistories() {
    // The newest chords of a history side by side, so that most comparisons look at one word.
    struct CKeyed {
        std::uint64_t mNewest;
        std::uint32_t mPlace;
    };
    std::vector<CKeyed> keyed;
    keyed.reserve(mPlaces.size());
    const auto word = [this](std::size_t place, std::size_t back) {
        return static_cast<std::uint64_t>(IdAhead(place, back) + 3);
    };
    for (std::size_t place = 0; place < mPlaces.size(); ++place) {
        if (mPlaces[place].mId < 0) continue;
        keyed.push_back(
            {word(place, 1) << 32U | word(place, 2), static_cast<std::uint32_t>(place)});
    }
    std::sort(keyed.begin(), keyed.end(), [this](const CKeyed& a, const CKeyed& b) {
        if (a.mNewest != b.mNewest) return a.mNewest < b.mNewest;
        for (std::size_t back = 3; back <= kLongestHistory; ++back) {
            const std::int32_t idOfA = IdAhead(a.mPlace, back);
            const std::int32_t idOfB = IdAhead(b.mPlace, back);
            if (idOfA != idOfB) return idOfA < idOfB;
        }
        return a.mPlace < b.mPlace;
    });
    mByHistory.reserve(keyed.size());
    for (const CKeyed& entry : keyed) mByHistory.push_back(entry.mPlace);
}

/// The places among `range` with a chord `back` places before them.
CSongModel::CRange CSongModel::Narrowed(CRange range, std::int32_t id, std::size_t back) const {
    const auto begin = mByHistory.begin() + static_cast<std::ptrdiff_t>(range.mBegin);
    const auto end = mByHistory.begin() + static_cast<std::ptrdiff_t>(range.mEnd);
    const auto first = std::lower_bound(begin, end, id, [&](std::uint32_t place, std::int32_t key) {
        return IdAhead(place, back) < key;
    });
    const auto last = std::upper_bound(first, end, id, [&](std::int32_t key, std::uint32_t place) {
        return key < IdAhead(place, back);
    });
    return {static_cast<std::size_t>(first - mByHistory.begin()),
            static_cast<std::size_t>(last - mByHistory.begin())};
}

CSoundingChord CSongModel::SoundAt(std::size_t place) const {
    const CPlace& at = mPlaces[place];
    const CRelativeChord& chord = Chord(at.mId);
    return {at.mRoot, chord.mBass, chord.mMask, at.mLength};
}

/// A number for the pair that ends at a place, which must have a chord before it.
std::uint64_t CSongModel::PairAt(std::size_t place) const {
    return PairNumber(SoundAt(place - 1), SoundAt(place));
}

void CSongModel::SortPairs() {
    std::vector<std::pair<std::uint64_t, std::uint32_t>> pairs;
    pairs.reserve(mPlaces.size());
    for (std::size_t place = 1; place < mPlaces.size(); ++place) {
        if (mPlaces[place].mId < 0 || mPlaces[place - 1].mId < 0) continue;
        pairs.emplace_back(PairAt(place), static_cast<std::uint32_t>(place));
    }
    std::sort(pairs.begin(), pairs.end());
    mByPair.reserve(pairs.size());
    for (const auto& [number, place] : pairs) mByPair.push_back(place);
}

std::span<const std::uint32_t> CSongModel::PlacesOfPair(const CSoundingChord& before,
                                                        const CSoundingChord& chord) const {
    const std::uint64_t number = PairNumber(before, chord);
    const auto first =
        std::partition_point(mByPair.begin(), mByPair.end(),
                             [&](std::uint32_t place) { return PairAt(place) < number; });
    const auto last = std::partition_point(
        first, mByPair.end(), [&](std::uint32_t place) { return PairAt(place) == number; });
    return {mByPair.data() + (first - mByPair.begin()), static_cast<std::size_t>(last - first)};
}

}  // namespace brindle
