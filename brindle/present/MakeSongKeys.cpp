// SPDX-License-Identifier: MIT
#include "brindle/present/MakeSongKeys.h"

#include "brindle/present/CChordSymbols.h"
#include "brindle/present/ShownNames.h"

namespace brindle {

CShownKeys MakeSongKeys(const CHarmAnlsChords& chords, const CChordSymbols& symbols,
                        const CKeyOptions& options, const CNumeralOptions& numeralOptions) {
    const CKeyOfSong found = FindKeys(chords, options);
    const std::vector<std::string> numerals = NumeralsOf(chords, found, numeralOptions);
    CShownKeys keys;
    keys.mKey = found.mKey;
    if (!found.mKey.IsUndef()) keys.mName = found.mKey.NameLong(NamePrefs());
    keys.mConfidence = found.mConfidence;
    keys.mScores = found.mScores;
    for (const CKeyRegion& region : found.mRegions) {
        CShownKeyRegion shown{region.mKey,
                              region.mKey.NameLong(NamePrefs()),
                              {region.mPosition, region.mEndPosition},
                              {}};
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

}  // namespace brindle
