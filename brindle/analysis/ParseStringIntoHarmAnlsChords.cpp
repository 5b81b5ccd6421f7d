// SPDX-License-Identifier: MIT
#include "brindle/analysis/ParseStringIntoHarmAnlsChords.h"

#include "brindle/analysis/TChordStringParse.h"
#include "brindle/chords/CChordSetFromStringHelper.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <utility>

namespace brindle {

CHarmAnlsChords::CHarmAnlsChords(std::string_view text, const TChordStringParse& parse) {
    ParseStringIntoChords(text, parse);
}

void CHarmAnlsChords::ParseStringIntoChords(std::string_view text, const TChordStringParse& parse) {
    *this = ParseStringIntoHarmAnlsChords::ParseIntoChords(text, parse);
}

namespace ParseStringIntoHarmAnlsChords {

namespace {

// The hyphen goes, too: C-7 reads as C7, never as a minor chord.
constexpr std::string_view kIgnoredCharacters = "{}-";

std::string WithoutIgnoredCharacters(std::string_view text) {
    std::string kept;
    kept.reserve(text.size());
    std::copy_if(text.begin(), text.end(), std::back_inserter(kept),
                 [](char c) { return kIgnoredCharacters.find(c) == kIgnoredCharacters.npos; });
    return kept;
}

bool Contains(const std::vector<std::string>& tokens, const std::string& token) {
    return std::find(tokens.begin(), tokens.end(), token) != tokens.end();
}

bool ContinuesSymbol(const std::string& token) {
    return token.compare(0, 2, "ma") == 0;
}

/// Places the tokens of one text in time.
class CTokenWalk {
public:
    explicit CTokenWalk(const TChordStringParse& parse) : mParse(parse) {}

    void Take(const std::string& token) {
        if (token.empty()) return;
        if (Contains(mParse.mBarTokens, token)) {
            mPosition = std::ceil(mPosition / mParse.mBeatsPerBar) * mParse.mBeatsPerBar;
            return;
        }
        if (!Contains(mParse.mHoldTokens, token)) {
            CChordLite chord;
            CChordSetFromStringHelper::SetFromString(token, chord, mParse.mChordNamePrefs);
            mChords.emplace_back(chord, mPosition);
        }
        mPosition += mParse.mBeatsPerChord;
    }

    CHarmAnlsChords ChordsWithEndMarker() && {
        if (!mChords.empty()) mChords.emplace_back(CChordLite_Undef, mPosition);
        return std::move(mChords);
    }

private:
    const TChordStringParse& mParse;
    double mPosition = 0.0;
    CHarmAnlsChords mChords;
};

}  // namespace

CHarmAnlsChords ParseIntoChords(std::string_view text, const TChordStringParse& parse) {
    if (text.empty()) return {};
    std::vector<std::string> tokens = parse.mSeparator.Split(WithoutIgnoredCharacters(text));
    _CorrectTokenizationOf(tokens);
    CTokenWalk walk(parse);
    for (const std::string& token : tokens) walk.Take(token);
    return std::move(walk).ChordsWithEndMarker();
}

void _CorrectTokenizationOf(std::vector<std::string>& tokens) {
    std::size_t kept = 0;
    const auto keep = [&](std::size_t i) {
        if (kept != i) tokens[kept] = std::move(tokens[i]);
        ++kept;
    };
    for (std::size_t i = 0; i < tokens.size(); ++i) {
        if (i == 0 || !ContinuesSymbol(tokens[i])) {
            keep(i);
            continue;
        }
        tokens[kept - 1] += tokens[i];
        // Kept: the token behind a joined one is not looked at. C maj7 maj9 stays two tokens.
        if (++i < tokens.size()) keep(i);
    }
    tokens.resize(kept);
}

}  // namespace ParseStringIntoHarmAnlsChords
}  // namespace brindle
