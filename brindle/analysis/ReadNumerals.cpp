// SPDX-License-Identifier: MIT
#include "brindle/analysis/ReadNumerals.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/internal/ChordRows.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/Utf8.h"

#include <algorithm>
#include <optional>
#include <utility>

namespace brindle {
namespace {

bool IsWordOfNoChord(std::string_view word) {
    return ReadChordText(word).mKind == TChordText_NoChord;
}

/// The column behind some text of a word, in characters.
std::size_t ColumnBehind(const CNumeralWord& word, std::string_view text) {
    return word.mColumn + CountUtf8Characters(text);
}

/// `2-5-1`, which could be a chord with many tones, too; `2-7` is one.
bool IsRowOfDegrees(std::string_view word) {
    if (word.size() < 5 || !Ascii::IsDigit(word[0])) return false;
    const std::vector<std::string_view> pieces = ChordText::PiecesOfRow(word);
    return pieces.size() > 2 && std::all_of(pieces.begin(), pieces.end(), [](auto piece) {
               return piece.size() == 1 && piece[0] >= '1' && piece[0] <= '7';
           });
}

/// `ii-V-I`: adds the pieces as words of their own, or nothing if one of them is not understood.
template <class TRead>
bool AddRow(const CNumeralWord& row, TRead read, std::vector<CNumeralWord>& words) {
    const std::size_t count = words.size();
    std::size_t column = row.mColumn;
    const char* counted = row.mText.data();
    for (const std::string_view piece : ChordText::PiecesOfRow(row.mText)) {
        column += CountUtf8Characters({counted, static_cast<std::size_t>(piece.data() - counted)});
        counted = piece.data();
        words.push_back({std::string(piece), row.mLine, column, {}});
        if (!read(words.back())) continue;
        words.resize(count);
        return false;
    }
    return true;
}

/// `read` takes the chord of a word or tells what is wrong with it.
template <class TRead>
CNumeralsReading ReadWords(std::string_view text, TRead read) {
    CNumeralsReading reading;
    for (CNumeralWord& word : NumeralWords(text)) {
        if (ChordText::IsSeparator(word.mText)) continue;
        if (!word.IsMark() && !IsWordOfNoChord(word.mText)) {
            const std::optional<CTextFault> fault = read(word);
            const bool couldBeRow = fault || IsRowOfDegrees(word.mText);
            if (couldBeRow && AddRow(word, read, reading.mWords)) continue;
            if (fault) reading.mFaults.push_back(*fault);
        }
        reading.mWords.push_back(std::move(word));
    }
    return reading;
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
    return ReadWords(text, [&](CNumeralWord& word) -> std::optional<CTextFault> {
        const CNumeralReading numeral = ReadNumeral(word.mText, key, options);
        word.mChord = numeral.mChord;
        if (numeral.mFault.empty()) return std::nullopt;
        const auto before = std::string_view(word.mText).substr(0, numeral.mFaultOffset);
        return CTextFault{word.mLine, ColumnBehind(word, before), std::string(numeral.mFault)};
    });
}

CNumeralsReading ReadChordWords(std::string_view text) {
    return ReadWords(text, [](CNumeralWord& word) -> std::optional<CTextFault> {
        word.mChord = ReadChordText(word.mText).mChord;
        if (!word.mChord.IsUndef()) return std::nullopt;
        return CTextFault{word.mLine, word.mColumn, "this is no chord"};
    });
}

bool BeginsWithNumeral(std::string_view text, const CSignKeyLite& key) {
    const std::vector<CNumeralWord> words = NumeralWords(text);
    for (const CNumeralWord& word : words) {
        if (word.IsMark() || ChordText::IsSeparator(word.mText)) continue;
        if (ChordFromNumeral(word.mText, key)) return true;
        if (ChordFromNumeral(ChordText::PiecesOfRow(word.mText).front(), key)) return true;
        if (!IsWordOfNoChord(word.mText)) return false;
    }
    return false;
}

}  // namespace brindle
