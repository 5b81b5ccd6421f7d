// SPDX-License-Identifier: MIT
#include "brindle/song/CSongModel.h"

#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <cmath>
#include <numeric>

namespace brindle {
namespace {

std::int32_t TickInBar(std::int32_t tick) {
    return ((tick % kTicksPerBar) + kTicksPerBar) % kTicksPerBar;
}

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

/// A chord of a song at a place of the bar.
struct CHeard {
    std::int32_t mId;
    std::int32_t mSong;
    TBarPlace mBarPlace;
};

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

TBarPlace BarPlaceOf(std::int32_t tick) {
    const std::int32_t within = TickInBar(tick);
    if (within == kTicksPerBar / 2) return TBarPlace_Middle;
    if (within != 0) return TBarPlace_Weak;
    const std::int32_t bar = (tick - within) / kTicksPerBar;
    return static_cast<TBarPlace>(((bar % 4) + 4) % 4);
}

void CSongShares::AddSong(const std::array<std::uint32_t, kBarPlaceCount>& times) {
    for (std::size_t place = 0; place < kBarPlaceCount; ++place) {
        mAt[place] += std::sqrt(static_cast<float>(times[place]));
    }
    const std::uint32_t all = std::accumulate(times.begin(), times.end(), 0U);
    mAll += std::sqrt(static_cast<float>(all));
}

CSongModel::CSongModel(std::vector<CTaughtSong> songs) : mSongs(std::move(songs)) {
    std::erase_if(mSongs, [](const CTaughtSong& song) { return song.mChords.empty(); });
    for (std::size_t index = 0; index < mSongs.size(); ++index) AddSong(index);
    SortHistories();
    SortPairs();
    CountPlaces();
    ShareTriples();
    CountSuccessors();
    CountLengths();
    CountKinds();
    PredictAlone();
}

void CSongModel::AddSong(std::size_t index) {
    const CTaughtSong& song = mSongs[index];
    const auto songNumber = static_cast<std::int32_t>(index);
    mPlaces.push_back(
        {StartId(song.mKey.mSignKeyType == TSignKeyType_Minor), 0, songNumber, TBarPlace_Weak, 0});
    int tonic = 0;
    for (const CTaughtChord& chord : song.mChords) {
        tonic = FoldIntoOctave(tonic + chord.mChord.mShift);
        const auto next = static_cast<std::int32_t>(mVocabulary.size());
        const auto [known, isNew] = mIds.try_emplace(chord.mChord.Code(), next);
        if (isNew) mVocabulary.push_back(chord.mChord);
        const auto root = static_cast<std::uint8_t>(FoldIntoOctave(tonic + chord.mChord.mRoot));
        mPlaces.push_back(
            {known->second, chord.mLength, songNumber, BarPlaceOf(chord.mBegin), root});
    }
}

std::int32_t CSongModel::IdOf(const CRelativeChord& chord) const {
    const auto known = mIds.find(chord.Code());
    return known == mIds.end() ? -1 : known->second;
}

std::int32_t CSongModel::HistoryIdOf(const CRelativeChord& chord) const {
    const std::int32_t id = IdOf(chord);
    return id >= 0 ? id : UnknownId(chord.mIsMinorKey);
}

bool CSongModel::IsInMinor(std::int32_t historyId) const {
    if (historyId >= 0) return Chord(historyId).mIsMinorKey;
    return historyId == UnknownId(true) || historyId == StartId(true);
}

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
    mChordShares.resize(mVocabulary.size());
    mSuccessorBegins.assign(1, 0);
    std::vector<CHeard> heard;
    const auto hear = [&](std::uint32_t place) {
        const CPlace& at = mPlaces[place];
        heard.push_back({at.mId, at.mSong, at.mBarPlace});
    };
    const auto count = static_cast<std::int32_t>(mVocabulary.size());
    // In the order of SuccessorsOf: both starts, then the chords.
    for (std::int32_t id = -3; id < count; ++id) {
        if (id == -1) continue;
        const CRange range = Narrowed({0, mByHistory.size()}, id, 1);
        heard.clear();
        for (std::size_t ix = range.mBegin; ix < range.mEnd; ++ix) hear(mByHistory[ix]);
        ShareHeard(heard, [&](std::int32_t next) -> CSongShares& {
            const bool isNew =
                mSuccessors.size() == mSuccessorBegins.back() || mSuccessors.back().mId != next;
            if (isNew) mSuccessors.push_back({next, {}});
            return mSuccessors.back().mShares;
        });
        mSuccessorBegins.push_back(mSuccessors.size());
    }
    const auto share = [&heard](std::vector<CSongShares>& shares) {
        ShareHeard(heard, [&](std::int32_t id) -> CSongShares& {
            return shares[static_cast<std::size_t>(id)];
        });
    };
    heard.clear();
    for (const std::uint32_t place : mByHistory) hear(place);
    share(mChordShares);
    for (const bool isMinor : {false, true}) {
        mModeShares[isMinor].resize(mVocabulary.size());
        heard.clear();
        for (const std::uint32_t place : mByHistory) {
            if (IsInMinor(mPlaces[place - 1].mId) == isMinor) hear(place);
        }
        share(mModeShares[isMinor]);
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

std::uint32_t CSongModel::CountOf(std::int32_t id) const {
    return mCounts[static_cast<std::size_t>(id)];
}

std::uint32_t CSongModel::EndCountOf(std::int32_t id) const {
    return mEndCounts[static_cast<std::size_t>(id)];
}

std::uint32_t CSongModel::FinalCountOf(std::int32_t id) const {
    return mFinalCounts[static_cast<std::size_t>(id)];
}

double CSongModel::RestRatioAt(TBarPlace place) const {
    // The first beats of bars are alike: which of four is the last one is a matter of length.
    const auto shareOf = [place](const std::array<std::uint32_t, kBarPlaceCount>& counts) {
        const auto first = std::min<std::size_t>(place, TBarPlace_Middle);
        const double onFirstBeats = std::accumulate(counts.begin(), counts.begin() + 4, 0.5);
        const double all = std::accumulate(counts.begin() + 4, counts.end(), onFirstBeats + 1.0);
        return (first < TBarPlace_Middle ? onFirstBeats : counts[place] + 0.5) / all;
    };
    return shareOf(mRestCounts) / shareOf(mPlaceCounts);
}

std::span<const CSongModel::CSuccessor> CSongModel::SuccessorsOf(std::int32_t id) const {
    if (id == UnknownId(false) || id == UnknownId(true) || mSuccessorBegins.empty()) return {};
    const auto index = static_cast<std::size_t>(id < 0 ? id + 3 : id + 2);
    return std::span(mSuccessors)
        .subspan(mSuccessorBegins[index], mSuccessorBegins[index + 1] - mSuccessorBegins[index]);
}

const CLengthCounts& CSongModel::LengthsAt(int beatsPerBar, std::int32_t tickInBar,
                                           std::int32_t lengthBefore) const {
    static const CLengthCounts none;
    const auto found = mLengths.find({beatsPerBar, tickInBar, lengthBefore});
    return found == mLengths.end() ? none : found->second;
}

}  // namespace brindle
