// SPDX-License-Identifier: MIT
#include "brindle/song/AnalyseSong.h"

#include "brindle/analysis/CAnalyseHarmCenterAlternatives.h"
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/musicxml/internal/PlaceChordsOfScore.h"

#include <cstddef>

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

}  // namespace

CSongAnalysis AnalyseSong(const CSong& song, const CAnalyseSongOptions& options) {
    CSongAnalysis found;
    const bool isGiven = !options.mSignKeys.empty();
    const CHarmAnlsSignKeys& signKeys = isGiven ? options.mSignKeys : song.mStatedKeys;
    if (IsScore(song.mFormat)) {
        found.mAnalyse.mSignKeys = signKeys;
        AnalyseScore(song, options.mRoute, found.mAnalyse);
    } else {
        found.mAnalyse.AnalyseFromChords(song.mChords, signKeys, options.mRoute);
    }
    if (options.mReadings) {
        found.mReadings = CAnalyseHarmCenterAlternatives(song.mChords).BestResults();
    }
    if (options.mCopies) found.mCopies = FindCopiedPassages(found.mAnalyse);
    found.mKeys = FindKeys(song.mChords, {.mBeatsPerBar = song.mBeatsPerBar});
    found.mNumerals = NumeralsOf(song.mChords, found.mKeys, {});
    return found;
}

}  // namespace brindle
