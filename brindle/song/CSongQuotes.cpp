// SPDX-License-Identifier: MIT
#include "brindle/song/CSongQuotes.h"

#include <algorithm>

namespace brindle {
namespace {

/// The tick at which a place of a song begins.
std::int32_t TickOfPlace(const CSongModel& model, std::uint32_t place) {
    const auto places = model.Places();
    std::size_t chord = 0;
    while (chord < place && places[place - chord - 1].mSong == places[place].mSong) ++chord;
    // Before the chords of a song stands its start.
    const CTaughtSong& song = model.Songs()[static_cast<std::size_t>(places[place].mSong)];
    return song.mChords[chord - 1].mBegin;
}

}  // namespace

std::int32_t CSongQuotes::Length() const {
    std::int32_t longest = 0;
    for (const CMatch& match : mMatches) longest = std::max(longest, match.mLength);
    return longest > mWished ? longest : 0;
}

void CSongQuotes::Add(const CQuotedChord& chord) {
    std::vector<CMatch> matches;
    const std::int32_t ofPair = mLast.mLength + chord.mChord.mLength;
    auto before = mMatches.begin();
    if (mLast.mLength > 0) {
        for (const std::uint32_t place : mModel->PlacesOfPair(mLast, chord.mChord)) {
            // Both lists are by place.
            while (before != mMatches.end() && before->mPlace + 1 < place) ++before;
            const bool goesOn = before != mMatches.end() && before->mPlace + 1 == place;
            matches.push_back({place, goesOn ? before->mLength + chord.mChord.mLength : ofPair});
        }
    }
    mMatches = std::move(matches);
    mLast = chord.mChord;
    mWished = chord.mIsWished ? mWished + chord.mChord.mLength : 0;
}

CSongQuote LongestQuote(const CSongModel& model, std::span<const CQuotedChord> chords) {
    CSongQuotes quotes(model);
    CSongQuote longest;
    std::uint32_t place = 0;
    std::int32_t tick = 0;
    for (const CQuotedChord& chord : chords) {
        quotes.Add(chord);
        tick += chord.mChord.mLength;
        for (const CSongQuotes::CMatch& match : quotes.mMatches) {
            if (match.mLength <= longest.mLength) continue;
            longest.mLength = match.mLength;
            longest.mTick = tick - match.mLength;
            place = match.mPlace;
        }
    }
    if (longest.mLength == 0) return longest;
    const auto places = model.Places();
    longest.mSong = places[place].mSong;
    longest.mSourceTick = TickOfPlace(model, place) + places[place].mLength - longest.mLength;
    return longest;
}

bool QuotesMoreThan(std::int32_t ticks, const CSongModel& model,
                    std::span<const CQuotedChord> chords) {
    CSongQuotes quotes(model);
    for (const CQuotedChord& chord : chords) {
        quotes.Add(chord);
        if (quotes.Length() > ticks) return true;
    }
    return false;
}

}  // namespace brindle
