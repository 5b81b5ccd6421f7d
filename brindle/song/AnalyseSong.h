// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/CopiedPassages.h"
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/song/CSong.h"

#include <string>
#include <vector>

namespace brindle {

struct TMusicXMLDoc;

/// What is to be found in a song.
struct CAnalyseSongOptions {
    TAnalyse mRoute = TAnalyse_TonicProgressions;  ///< how centers are looked for
    /// All readings that progressions to a tonic allow.
    bool mReadings = false;
    /// Passages that repeat earlier ones.
    bool mCopies = false;
    CNumeralOptions mNumerals{};  ///< how numerals are written
};

/// What was found in a song. Empty for a song without chords.
struct CSongAnalysis {
    /// Its `mChords` are those of the song.
    CHarmonicAnalyse mAnalyse;
    /// Empty if they were not asked for.
    CHarmAnlsCenters mReadings;
    bool mHasReadings = false;  ///< they were asked for, even if none was found
    /// Empty if they were not asked for.
    std::vector<CCopiedPassage> mCopies;
    CKeyOfSong mKeys;  ///< the key of the song and its local keys
    /// Of each chord in the key of its region; empty for one that has none.
    std::vector<std::string> mNumerals;
};

/// States the key of a song from its begin, instead of the keys that it states itself; an undefined
/// key states nothing. To be believed even of a score, it also goes to ReadSongHarmony.
void StateKey(const CSignKeyLite& key, CSong& song);
/// The same for a score.
void StateKey(const CSignKeyLite& key, TMusicXMLDoc& sheet);

/// The centers of a song alone, searched in one way. Its `mChords` are those of the song.
[[nodiscard]] CHarmonicAnalyse FindCenters(const CSong& song, TAnalyse route);

/// Finds centers and functions, the key and the local keys of a song, its readings and copies.
[[nodiscard]] CSongAnalysis AnalyseSong(const CSong& song, const CAnalyseSongOptions& options = {});

/// The same for a score in any timing. The chords of `mAnalyse` are those of the score, with an
/// undefined one where none sounds and at the end.
[[nodiscard]] CSongAnalysis AnalyseSheet(const TMusicXMLDoc& sheet,
                                         const CAnalyseSongOptions& options = {});

}  // namespace brindle
