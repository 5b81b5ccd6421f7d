// SPDX-License-Identifier: MIT
#include "brindle/song/AnalyseSong.h"

#include "brindle/analysis/CAnalyseHarmCenterAlternatives.h"
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/musicxml/internal/PlaceChordsOfScore.h"
#include "brindle/song/SheetTimes.h"
#include "brindle/song/internal/StatedKey.h"

#include <cstddef>
#include <utility>

namespace brindle {

namespace {

/// The rests of a score are none to its analysis.
void AnalyseScore(const CSong& song, TAnalyse route, CHarmonicAnalyse& analyse) {
    double end = kPosUndef;
    for (std::size_t i = 0; i + 1 < song.mChords.size(); ++i) {
        if (song.mChords[i].IsUndef()) continue;
        analyse.mChords.push_back(song.mChords[i]);
        end = song.mChords[i + 1].mPosition;
    }
    PlaceChordsOfScore(analyse.mChords, end, analyse);
    analyse.Analyse(route);
    analyse.mChords = song.mChords;
}

/// What is found beside the centers.
CSongAnalysis WithAllFound(CHarmonicAnalyse analyse, double beatsPerBar,
                           const CAnalyseSongOptions& options) {
    CSongAnalysis found;
    found.mAnalyse = std::move(analyse);
    const CHarmAnlsChords& chords = found.mAnalyse.mChords;
    found.mHasReadings = options.mReadings;
    if (options.mReadings) found.mReadings = CAnalyseHarmCenterAlternatives(chords).BestResults();
    if (options.mCopies) found.mCopies = FindCopiedPassages(found.mAnalyse);
    found.mKeys = FindKeys(chords, {.mBeatsPerBar = beatsPerBar});
    found.mNumerals = NumeralsOf(chords, found.mKeys, options.mNumerals);
    return found;
}

}  // namespace

void StateKey(const CSignKeyLite& key, CSong& song) {
    if (key.IsUndef()) return;
    song.mStatedKeys.clear();
    AppendStatedKey(key, 0.0, song);
}

void StateKey(const CSignKeyLite& key, TMusicXMLDoc& sheet) {
    if (key.IsUndef()) return;
    CSong stated;
    StateKey(key, stated);
    sheet.HarmSignKeys = stated.mStatedKeys;
}

CHarmonicAnalyse FindCenters(const CSong& song, TAnalyse route) {
    CHarmonicAnalyse analyse;
    if (IsScore(song.mFormat)) {
        analyse.mSignKeys = song.mStatedKeys;
        AnalyseScore(song, route, analyse);
    } else {
        analyse.AnalyseFromChords(song.mChords, song.mStatedKeys, route);
    }
    return analyse;
}

CSongAnalysis AnalyseSong(const CSong& song, const CAnalyseSongOptions& options) {
    return WithAllFound(FindCenters(song, options.mRoute), song.mBeatsPerBar, options);
}

CSongAnalysis AnalyseSheet(const TMusicXMLDoc& sheet, const CAnalyseSongOptions& options) {
    CHarmonicAnalyse analyse;
    analyse.AnalyseFromMusicXMLDoc(sheet, options.mRoute);
    analyse.mChords = WithRests(analyse.mChords, sheet);
    return WithAllFound(std::move(analyse), BeatsPerBarOf(sheet), options);
}

}  // namespace brindle
