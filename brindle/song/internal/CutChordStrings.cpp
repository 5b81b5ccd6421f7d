// SPDX-License-Identifier: MIT
#include "brindle/platform/ReadNumber.h"
#include "brindle/song/internal/SongTokens.h"
#include "brindle/song/internal/SongWords.h"

#include <algorithm>
#include <cmath>
#include <string>

namespace brindle::SongText {

namespace {

/// `(4,Gm(maj7))` is 4 and `Gm(maj7)`; the brackets around both may be missing.
struct CStringElement {
    double mLength = 0.0;
    std::string_view mSymbol;
};

CStringElement ElementOf(std::string_view text) {
    if (Ascii::TakePrefix(text, "(") && text.ends_with(')')) text.remove_suffix(1);
    const std::size_t comma = std::min(text.find(','), text.size());
    const double length = ReadDecimal(text.substr(0, comma));
    return {length, Trimmed(text.substr(std::min(comma + 1, text.size())))};
}

void AddChord(const CStringElement& element, CTokenList& list) {
    const CChordTextReading reading = ReadChordText(element.mSymbol, list.Prefs().mChordTextPrefs);
    if (element.mSymbol == "U") {
        list.Add(TTokenKind::Chord, element.mSymbol);
    } else if (reading.mKind == TChordText_Repeat) {
        list.AddFault(element.mSymbol, "a chord is wanted with its length, and no repeat");
        return;
    } else {
        list.AddReading(element.mSymbol, reading);
    }
    list.mTokens.back().mLength = element.mLength;
}

void CutElement(std::string_view text, CTokenList& list) {
    text = Trimmed(text);
    if (text.empty()) return;
    const CStringElement element = ElementOf(text);
    const bool isLength = std::isfinite(element.mLength) && element.mLength > 0.0;
    if (isLength && !element.mSymbol.empty()) return AddChord(element, list);
    list.AddFault(text,
                  "\"" + std::string(ShownOf(text)) + "\" is no length and chord, as in (4,C)");
}

void CutLine(std::string_view line, CTokenList& list) {
    // Lines do not go on from each other.
    if (!list.mTokens.empty() && !Trimmed(line).empty()) list.Add(TTokenKind::Section);
    while (!line.empty() && !list.IsGivenUp()) {
        const std::string_view element = line.substr(0, line.find(';'));
        CutElement(element, list);
        line.remove_prefix(std::min(element.size() + 1, line.size()));
    }
}

}  // namespace

void CutChordStrings(CTokenList& list) {
    std::string_view rest = list.Text();
    while (!rest.empty() && !list.IsGivenUp()) CutLine(TakeLine(rest), list);
}

}  // namespace brindle::SongText
