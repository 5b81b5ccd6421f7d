// SPDX-License-Identifier: MIT
#include "brindle/present/CChordSymbols.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/present/ShownText.h"
#include "brindle/song/HarmonySymbols.h"

#include <algorithm>

namespace brindle {

CChordSymbols::CChordSymbols(const std::vector<std::string>& symbols,
                             const CHarmAnlsChords& chords) {
    const std::size_t count = std::min(symbols.size(), chords.size());
    for (std::size_t i = 0; i < count; ++i) {
        mPositions.push_back(chords[i].mPosition);
        mChords.push_back(chords[i]);
        mSymbols.push_back(Printable(symbols[i]));
    }
}

CChordSymbols::CChordSymbols(const TMusicXMLDoc& sheet, const CHarmAnlsChords& chords) {
    const std::size_t count = std::min(sheet.Harmonies.size(), chords.size());
    for (std::size_t i = 0; i < count; ++i) {
        mPositions.push_back(chords[i].mPosition);
        mChords.push_back(chords[i]);
        mSymbols.push_back(HarmonySymbol(sheet.Harmonies[i]));
    }
}

// Several chords may stand at one place.
const std::string& CChordSymbols::SymbolOf(const CHarmAnlsChordWithPos& chord) const {
    static const std::string none;
    const auto [first, behind] =
        std::equal_range(mPositions.begin(), mPositions.end(), chord.mPosition);
    if (first == behind) return none;
    const auto begin = static_cast<std::size_t>(first - mPositions.begin());
    const auto end = static_cast<std::size_t>(behind - mPositions.begin());
    for (std::size_t i = begin; i < end; ++i) {
        if (mChords[i] == chord) return mSymbols[i];
    }
    return mSymbols[begin];
}

}  // namespace brindle
