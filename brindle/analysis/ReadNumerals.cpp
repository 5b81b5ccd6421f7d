// SPDX-License-Identifier: MIT
#include "brindle/analysis/ReadNumerals.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/Utf8.h"

#include <algorithm>

namespace brindle {
namespace {

bool IsWordOfNoChord(std::string_view word) {
    return ReadChordText(word).mKind == TChordText_NoChord;
}

}  // namespace

std::vector<CNumeralWord> NumeralWords(std::string_view text) {
    std::vector<CNumeralWord> words;
    std::size_t line = 1;
    std::size_t column = 1;
    while (!text.empty()) {
        const bool isBreak = text.front() == '\n';
        if (Ascii::IsWhiteSpace(text.front())) {
            line += isBreak ? 1 : 0;
            column = isBreak ? 1 : column + 1;
            text.remove_prefix(1);
            continue;
        }
        const std::string_view word = text.substr(0, text.find_first_of(Ascii::kWhiteSpace));
        words.push_back({std::string(word), line, column, {}});
        column += CountUtf8Characters(word);
        text.remove_prefix(word.size());
    }
    return words;
}

std::vector<std::string> NumeralsOfWords(const std::vector<CNumeralWord>& words,
                                         const CSignKeyLite& key, const CNumeralOptions& options) {
    CHarmAnlsChords chords;
    for (const CNumeralWord& word : words) {
        chords.emplace_back(word.mChord, static_cast<double>(chords.size()));
    }
    CKeyOfSong keys;
    keys.mRegions.push_back({.mKey = key, .mBegin = 0, .mEnd = chords.size()});
    return NumeralsOf(chords, keys, options);
}

CNumeralsReading ReadNumerals(std::string_view text, const CSignKeyLite& key,
                              const CNumeralOptions& options) {
    CNumeralsReading reading{NumeralWords(text), {}};
    for (CNumeralWord& word : reading.mWords) {
        if (word.IsMark()) continue;
        const CNumeralReading numeral = ReadNumeral(word.mText, key, options);
        word.mChord = numeral.mChord;
        if (numeral.mFault.empty() || IsWordOfNoChord(word.mText)) continue;
        const auto before = std::string_view(word.mText).substr(0, numeral.mFaultOffset);
        reading.mFaults.push_back(
            {word.mLine, word.mColumn + CountUtf8Characters(before), std::string(numeral.mFault)});
    }
    return reading;
}

CNumeralsReading ReadChordWords(std::string_view text) {
    CNumeralsReading reading{NumeralWords(text), {}};
    for (CNumeralWord& word : reading.mWords) {
        if (word.IsMark() || IsWordOfNoChord(word.mText)) continue;
        word.mChord = ReadChordText(word.mText).mChord;
        if (word.mChord.IsUndef()) {
            reading.mFaults.push_back({word.mLine, word.mColumn, "this is no chord"});
        }
    }
    return reading;
}

bool BeginsWithNumeral(std::string_view text, const CSignKeyLite& key) {
    const std::vector<CNumeralWord> words = NumeralWords(text);
    for (const CNumeralWord& word : words) {
        if (word.IsMark()) continue;
        if (ChordFromNumeral(word.mText, key)) return true;
        if (!IsWordOfNoChord(word.mText)) return false;
    }
    return false;
}

}  // namespace brindle
