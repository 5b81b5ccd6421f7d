// SPDX-License-Identifier: MIT
#include "brindle/present/SongSymbols.h"

#include "brindle/analysis/RomanNumeral.h"
#include "brindle/present/internal/ReadingBars.h"

namespace brindle {
namespace {

std::string SymbolIn(TSongNaming naming, const CChordLite& chord, const CChordReading& reading,
                     const CChordSymbolStyle& style) {
    switch (naming) {
        case TSongNaming_Nashville: {
            CNumeralOptions options;
            options.mNashville = true;
            return NumeralInStyle(reading.mNumeral, chord, reading.mKey, options);
        }
        case TSongNaming_Roman:
            return reading.mNumeral;
        case TSongNaming_Symbols:
            break;
    }
    return WriteChordSymbol(chord, style);
}

}  // namespace

std::vector<std::string> SongSymbols(const CSong& song, const CSongReading& reading,
                                     TSongNaming naming, const CChordSymbolStyle& style) {
    std::vector<std::string> symbols;
    const std::size_t count = ChordCountOf(song);
    symbols.reserve(count);
    for (std::size_t ix = 0; ix < count; ++ix) {
        const CChordLite& chord = song.mChords[ix];
        const std::string written = ix < song.mSymbols.size() ? song.mSymbols[ix] : std::string();
        const bool isChord = !chord.IsUndef() && ix < reading.mChords.size();
        symbols.push_back(isChord ? SymbolIn(naming, chord, reading.mChords[ix], style) : written);
    }
    return symbols;
}

}  // namespace brindle
