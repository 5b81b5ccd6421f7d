// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/internal/SongKeys.h"

namespace brindle {

CKeyOfSong FindKeys(const CHarmAnlsChords& chords, const CKeyOptions& options) {
    CKeyOfSong found;
    const std::vector<CKeyChord> heard = KeyChordsOf(chords);
    if (heard.empty()) return found;
    const CSongKeys keys = FindSongKeys(heard, options);
    const CKeySpeller speller(chords);
    found.mScores = keys.mScores;
    found.mKey = speller.SignKeyOf(keys.mBestScored);
    found.mConfidence = ConfidenceOf(keys.mScores, keys.mBestScored);
    found.mRegions = KeyRegionsOf(chords, heard, keys.mKeys, speller);
    return found;
}

}  // namespace brindle
