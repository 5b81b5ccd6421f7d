// SPDX-License-Identifier: MIT
#include "brindle/present/CChordSymbols.h"

#include "brindle/analysis/ParseStringIntoHarmAnlsChords.h"
#include "brindle/analysis/TChordStringParse.h"
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/present/ShownText.h"
#include "brindle/song/HarmonySymbols.h"

#include <algorithm>

namespace brindle {
namespace {

// What the reader of chord texts leaves out before it looks for tokens.
constexpr std::string_view kLeftOut = "{}-";

bool Contains(const std::vector<std::string>& list, const std::string& token) {
    return std::find(list.begin(), list.end(), token) != list.end();
}

// The chord tokens of a text, one for each chord that the library reads from it.
std::vector<std::string> ChordTokens(std::string_view text, const TChordStringParse& parse) {
    std::string kept(text);
    std::erase_if(kept, [](char c) { return kLeftOut.find(c) != kLeftOut.npos; });
    std::vector<std::string> tokens = parse.mSeparator.Split(kept);
    ParseStringIntoHarmAnlsChords::_CorrectTokenizationOf(tokens);
    std::erase_if(tokens, [&](const std::string& token) {
        return token.empty() || Contains(parse.mBarTokens, token) ||
               Contains(parse.mHoldTokens, token);
    });
    return tokens;
}

}  // namespace

CChordSymbols::CChordSymbols(std::string_view text, const TChordStringParse& parse,
                             const CHarmAnlsChords& chords)
    : CChordSymbols(ChordTokens(text, parse), chords) {}

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
