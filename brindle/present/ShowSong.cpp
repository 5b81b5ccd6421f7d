// SPDX-License-Identifier: MIT
#include "brindle/present/ShowSong.h"

#include "brindle/present/AnalysisJson.h"
#include "brindle/present/CChordSymbols.h"
#include "brindle/present/MakeSong.h"
#include "brindle/present/MakeSongCopies.h"
#include "brindle/present/MakeSongKeys.h"
#include "brindle/present/ShownText.h"
#include "brindle/song/AnalyseSong.h"

#include <algorithm>
#include <string>

namespace brindle {

namespace {

bool AreBarsEqual(const CSong& song) {
    return std::all_of(song.mBars.begin(), song.mBars.end(),
                       [&](const CSongBar& bar) { return bar.mLength == song.mBeatsPerBar; });
}

/// Empty for a text whose bars are all equal.
std::vector<double> BarStartsOf(const CSong& song) {
    std::vector<double> starts;
    if (!IsScore(song.mFormat) && AreBarsEqual(song)) return starts;
    for (const CSongBar& bar : song.mBars) starts.push_back(bar.mPosition);
    return starts;
}

CShownScore ScoreOf(const CSong& song) {
    CShownScore score;
    score.mTitle = Printable(song.mTitle);
    CSongTime time;
    for (const CSongBar& bar : song.mBars) {
        if (bar.mTime.IsUndef() || bar.mTime == time) continue;
        time = bar.mTime;
        score.mTimes.push_back({bar.mPosition, std::to_string(time.mNumerator) + "/" +
                                                   std::to_string(time.mDenominator)});
    }
    for (const CSongSection& section : song.mSections) {
        score.mSections.push_back(section.mPosition);
    }
    for (const CSongRepeat& repeat : song.mRepeats) {
        score.mCopies.push_back({repeat.mPosition, repeat.mSourcePosition, repeat.mBarCount});
    }
    return score;
}

const CHarmAnlsCenters* ReadingsOf(const CSongAnalysis& found) {
    return found.mReadings.empty() ? nullptr : &found.mReadings;
}

std::string JsonOf(const CSong& song, const CSongAnalysis& found, const CReadSong* read) {
    const CChordSymbols symbols(song.mSymbols, song.mChords);
    const CShownKeys keys =
        MakeSongKeys(song.mChords, symbols, {.mBeatsPerBar = song.mBeatsPerBar});
    return AnalysisJson(
        found.mAnalyse, ReadingsOf(found),
        [&](const CHarmAnlsChordWithPos& chord) -> const std::string& {
            return symbols.SymbolOf(chord);
        },
        keys, nullptr, read);
}

}  // namespace

CShownSong ShowSong(const CSong& song, const CSongAnalysis& found) {
    const CChordSymbols symbols(song.mSymbols, song.mChords);
    CShownSong shown = MakeSong(found.mAnalyse, ReadingsOf(found), symbols, song.mBeatsPerBar);
    shown.mScore = ScoreOf(song);
    shown.mBarStarts = BarStartsOf(song);
    if (!found.mCopies.empty()) shown.mCopies = MakeSongCopies(found.mAnalyse, symbols);
    return shown;
}

CShownSong ShowKeys(const CSong& song, const CSongReading& reading) {
    const CChordSymbols symbols(song.mSymbols, song.mChords);
    CShownSong shown =
        MakeSong(FindCenters(song, TAnalyse_None), nullptr, symbols, song.mBeatsPerBar);
    shown.mBarStarts = BarStartsOf(song);
    shown.mKeys = MakeSongKeys(song, reading);
    return shown;
}

std::string AnalysisJson(const CSong& song, const CSongAnalysis& found) {
    return JsonOf(song, found, nullptr);
}

std::string AnalysisJson(const CSong& song, const CSongAnalysis& found, const CSongReading& reading,
                         std::span<const std::string> explanations) {
    const CReadSong read{song, reading, explanations};
    return JsonOf(song, found, &read);
}

}  // namespace brindle
