// SPDX-License-Identifier: MIT
#include "brindle/present/MakeSongKeys.h"

#include "brindle/present/CChordSymbols.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/internal/ReadingNotes.h"
#include "brindle/song/AnalyseSong.h"

#include <algorithm>
#include <utility>

namespace brindle {
namespace {

CShownKeyRegion ShownRegion(const CSong& song, const CSongReading& reading,
                            const CKeyRegion& region) {
    CShownKeyRegion shown{
        region.mKey, KeyInWords(region.mKey), {region.mPosition, region.mEndPosition}, {}};
    const std::size_t end = std::min(region.mEnd, song.mSymbols.size());
    for (std::size_t i = region.mBegin; i < end; ++i) {
        const bool isLast = i + 1 == song.mChords.size();
        shown.mChords.push_back({{song.mChords[i].mPosition,
                                  isLast ? region.mEndPosition : song.mChords[i + 1].mPosition},
                                 song.mSymbols[i],
                                 reading.mChords[i].mNumeral});
    }
    return shown;
}

CShownKeys ShownKeys(const CHarmAnlsChords& chords, const CChordSymbols& symbols,
                     const CKeyOfSong& found, const std::vector<std::string>& numerals) {
    CShownKeys keys;
    keys.mKey = found.mKey;
    if (!found.mKey.IsUndef()) keys.mName = KeyInWords(found.mKey);
    keys.mConfidence = found.mConfidence;
    keys.mScores = found.mScores;
    for (const CKeyRegion& region : found.mRegions) {
        CShownKeyRegion shown{
            region.mKey, KeyInWords(region.mKey), {region.mPosition, region.mEndPosition}, {}};
        for (std::size_t i = region.mBegin; i < region.mEnd; ++i) {
            const bool isLast = i + 1 == chords.size();
            const double end = isLast ? region.mEndPosition : chords[i + 1].mPosition;
            shown.mChords.push_back(
                {{chords[i].mPosition, end}, symbols.SymbolOf(chords[i]), numerals[i]});
        }
        keys.mRegions.push_back(std::move(shown));
    }
    return keys;
}

}  // namespace

CShownKeys MakeSongKeys(const CSong& song, const CSongReading& reading) {
    CShownKeys keys;
    keys.mKey = reading.mKey;
    if (!reading.mKey.IsUndef()) keys.mName = KeyInWords(reading.mKey);
    keys.mConfidence = reading.mConfidence;
    for (const CKeyRegion& region : reading.mRegions) {
        keys.mRegions.push_back(ShownRegion(song, reading, region));
    }
    keys.mNotes = KeyContradictions(song, reading);
    return keys;
}

CShownKeys MakeSongKeys(const CHarmAnlsChords& chords, const CChordSymbols& symbols,
                        const CKeyOptions& options, const CNumeralOptions& numeralOptions) {
    const CKeyOfSong found = FindKeys(chords, options);
    return ShownKeys(chords, symbols, found, NumeralsOf(chords, found, numeralOptions));
}

CShownKeys MakeSongKeys(const CSongAnalysis& found, const CChordSymbols& symbols) {
    return ShownKeys(found.mAnalyse.mChords, symbols, found.mKeys, found.mNumerals);
}

}  // namespace brindle
