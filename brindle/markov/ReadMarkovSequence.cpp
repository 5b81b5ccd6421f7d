// SPDX-License-Identifier: MIT
#include "brindle/markov/ReadMarkovSequence.h"

#include "brindle/chords/ReadChordText.h"
#include "brindle/markov/MarkovChords.h"
#include "brindle/theory/KeyNames.h"

#include <algorithm>
#include <optional>
#include <sstream>
#include <utility>

namespace brindle {
namespace {

// No chord is longer.
constexpr double kMostBeatsOfChord = 1e6;

/// A word that is neither a chord nor "U"; empty if there is none.
std::string UnknownSymbol(const std::string& text) {
    std::istringstream elements(text);
    for (std::string element; std::getline(elements, element, ';');) {
        const CHarmAnlsChordsWithLength chords = HarmChordsFromChordString(element);
        const std::size_t comma = element.find(',');
        if (chords.empty() || !IsUndefinedForMarkov(chords.front()) || comma == element.npos) {
            continue;
        }
        const std::string symbol = element.substr(comma + 1, element.find(')') - comma - 1);
        if (symbol != "U") return symbol;
    }
    return {};
}

// A chord string with its symbols as the reader of such strings knows them: it takes the brackets
// of "(4,Gm(maj7))" away before it reads the chord.
std::string WithPlainSymbols(const std::string& text) {
    std::istringstream elements(text);
    std::string plain;
    for (std::string element; std::getline(elements, element, ';');) {
        plain += plain.empty() ? "" : ";";
        const std::size_t comma = element.find(',');
        const bool isPair =
            element.starts_with('(') && element.ends_with(')') && comma != element.npos;
        const auto symbol =
            isPair ? NormaliseChordSymbol(element.substr(comma + 1, element.size() - comma - 2))
                   : std::nullopt;
        plain += symbol ? element.substr(0, comma + 1) + *symbol + ")" : element;
    }
    return plain;
}

std::string WithoutBlanks(std::string text) {
    std::erase_if(text, [](char c) { return c == ' ' || c == '\t' || c == '\r' || c == '\n'; });
    if (!text.empty() && text.back() == ';') text.pop_back();
    return text;
}

}  // namespace

CMarkovSequenceText ReadMarkovSequence(std::string_view text) {
    std::string typed(text);
    ConvertUtf8SharpAndFlatToAscii(typed);
    typed = WithPlainSymbols(WithoutBlanks(std::move(typed)));
    const CHarmAnlsChordsWithLength chords = HarmChordsFromChordString(typed);
    const bool areLengths = std::all_of(chords.begin(), chords.end(), [](const auto& chord) {
        return chord.mLength > 0.0 && chord.mLength <= kMostBeatsOfChord;
    });
    if (chords.empty() || !areLengths) {
        return {{}, "chords with their lengths in beats are wanted, as in \"(4,C);(8,U);(4,G7)\""};
    }
    const std::string unknown = UnknownSymbol(typed);
    if (!unknown.empty()) return {{}, unknown + " is no chord; a gap is U"};
    CMarkovSequenceText read;
    MarkovObjectsVectorForHarmChords(chords, read.mSymbols);
    return read;
}

}  // namespace brindle
