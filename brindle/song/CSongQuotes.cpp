// SPDX-License-Identifier: MIT
#include "brindle/song/CSongQuotes.h"

#include <algorithm>

namespace brindle {
namespace {

bool IsAt(const CSongModel::CPlace& place, const CQuotedChord& chord) {
    return place.mId == chord.mId && place.mLength == chord.mLength;
}

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

bool CSongQuotes::GoesOn(const CMatch& match, const CQuotedChord& chord) const {
    const auto places = mModel->Places();
    const std::size_t next = match.mPlace + std::size_t{1};
    return next < places.size() && places[next].mSong == places[match.mPlace].mSong &&
           IsAt(places[next], chord);
}

std::int32_t CSongQuotes::LengthWith(const CQuotedChord& chord) const {
    std::int32_t longest = 0;
    for (const CMatch& match : mMatches) {
        if (match.mLength + chord.mLength > longest && GoesOn(match, chord)) {
            longest = match.mLength + chord.mLength;
        }
    }
    return longest;
}

void CSongQuotes::Add(const CQuotedChord& chord) {
    std::vector<CMatch> matches;
    if (chord.mId >= 0) {
        auto before = mMatches.begin();
        for (const std::uint32_t place : mModel->PlacesOf(chord.mId)) {
            if (!IsAt(mModel->Places()[place], chord)) continue;
            // Both lists are by place.
            while (before != mMatches.end() && before->mPlace + 1 < place) ++before;
            const bool goesOn = before != mMatches.end() && before->mPlace + 1 == place;
            matches.push_back({place, chord.mLength + (goesOn ? before->mLength : 0)});
        }
    }
    mMatches = std::move(matches);
}

CSongQuote LongestQuote(const CSongModel& model, std::span<const CQuotedChord> chords) {
    CSongQuotes quotes(model);
    CSongQuote longest;
    std::uint32_t place = 0;
    std::int32_t tick = 0;
    for (const CQuotedChord& chord : chords) {
        quotes.Add(chord);
        tick += chord.mLength;
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

}  // namespace brindle
