// SPDX-License-Identifier: MIT
#include "brindle/song/ParseSong.h"

#include "brindle/analysis/ParseStringIntoHarmAnlsChords.h"
#include "brindle/analysis/TChordStringParse.h"
#include "brindle/theory/KeyNames.h"

#include <algorithm>

namespace brindle {
namespace {

// What the parser leaves out before it looks for tokens.
constexpr std::string_view kLeftOut = "{}-";

bool IsIn(const std::vector<std::string>& marks, const std::string& token) {
    return std::find(marks.begin(), marks.end(), token) != marks.end();
}

// The chord tokens of a text, one for each chord that the parser reads from it.
std::vector<std::string> ChordTokens(std::string_view text, const TChordStringParse& parse) {
    std::string kept(text);
    std::erase_if(kept, [](char c) { return kLeftOut.find(c) != kLeftOut.npos; });
    std::vector<std::string> tokens = parse.mSeparator.Split(kept);
    ParseStringIntoHarmAnlsChords::_CorrectTokenizationOf(tokens);
    std::erase_if(tokens, [&](const std::string& token) {
        return token.empty() || IsIn(parse.mBarTokens, token) || IsIn(parse.mHoldTokens, token);
    });
    return tokens;
}

}  // namespace

CSong ParseSong(std::string_view text, const TChordStringParse& parse) {
    std::string folded(text);
    ConvertUtf8SharpAndFlatToAscii(folded);
    CSong song;
    song.mChords.ParseStringIntoChords(folded, parse);
    song.mSymbols = ChordTokens(text, parse);
    song.mSymbols.resize(std::min(song.mSymbols.size(), song.mChords.size()));
    song.mBeatsPerBar = parse.mBeatsPerBar;
    return song;
}

}  // namespace brindle
