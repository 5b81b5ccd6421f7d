// SPDX-License-Identifier: MIT
#include "brindle/song/CSongModel.h"

#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <cmath>
#include <numeric>

namespace brindle {

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
    ShareChords();
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
