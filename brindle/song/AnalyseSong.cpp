// SPDX-License-Identifier: MIT
#include "brindle/song/AnalyseSong.h"

#include "brindle/analysis/CAnalyseHarmCenterAlternatives.h"
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/musicxml/internal/PlaceChordsOfScore.h"
#include "brindle/song/internal/StatedKey.h"

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

void StateKey(const CSignKeyLite& key, CSong& song) {
    if (key.IsUndef()) return;
    song.mStatedKeys.clear();
    AppendStatedKey(key, 0.0, song);
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
    CSongAnalysis found;
    found.mAnalyse = FindCenters(song, options.mRoute);
    if (options.mReadings) {
        found.mReadings = CAnalyseHarmCenterAlternatives(song.mChords).BestResults();
    }
    if (options.mCopies) found.mCopies = FindCopiedPassages(found.mAnalyse);
    found.mKeys = FindKeys(song.mChords, {.mBeatsPerBar = song.mBeatsPerBar});
    found.mNumerals = NumeralsOf(song.mChords, found.mKeys, {});
    return found;
}

}  // namespace brindle
