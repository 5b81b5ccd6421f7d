// SPDX-License-Identifier: MIT
#include "brindle/present/ShowSong.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/present/CChordSymbols.h"
#include "brindle/present/MakeSong.h"
#include "brindle/present/MakeSongCopies.h"
#include "brindle/present/MakeSongKeys.h"
#include "brindle/song/AnalyseSong.h"
#include "brindle/song/SheetTimes.h"

#include <algorithm>

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

const CHarmAnlsCenters* ReadingsOf(const CSongAnalysis& found) {
    return found.mHasReadings ? &found.mReadings : nullptr;
}

}  // namespace

CShownSong ShowSong(const CSong& song, const CSongAnalysis& found) {
    const CChordSymbols symbols(song.mSymbols, song.mChords);
    CShownSong shown = MakeSong(found.mAnalyse, ReadingsOf(found), symbols, song.mBeatsPerBar);
    shown.mScore = MakeScore(SheetWithoutChords(song));
    shown.mBarStarts = BarStartsOf(song);
    if (!found.mCopies.empty()) shown.mCopies = MakeSongCopies(found.mAnalyse, symbols);
    return shown;
}

CShownSong ShowSong(const TMusicXMLDoc& sheet, const CSongAnalysis& found) {
    const CChordSymbols symbols(sheet, found.mAnalyse.mChords);
    CShownSong shown = MakeSong(found.mAnalyse, ReadingsOf(found), symbols, BeatsPerBarOf(sheet));
    shown.mScore = MakeScore(sheet);
    for (const CHarmBarline& line : sheet.HarmBarlines) shown.mBarStarts.push_back(line.mPosition);
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

}  // namespace brindle
