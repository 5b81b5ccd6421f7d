// SPDX-License-Identifier: MIT
#include "brindle/analysis/ReadNumerals.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/internal/ChordRows.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/Utf8.h"

#include <algorithm>
#include <array>
#include <optional>
#include <utility>

namespace brindle {
namespace {

bool IsWordOfNoChord(std::string_view word) {
    return ReadChordText(word).mKind == TChordText_NoChord;
}

/// `4`, `b7`, `57`
bool IsDegree(std::string_view piece) {
    if (piece.starts_with('b') || piece.starts_with('#')) piece.remove_prefix(1);
    const bool isSeventh = piece.size() == 2 && piece[1] == '7';
    return (piece.size() == 1 || isSeventh) && piece[0] >= '1' && piece[0] <= '7';
}

/// `2-5-1` and `1-4`, which could be chords with many tones, too. `2-7` and `1-6` are such chords.
bool IsRowOfDegrees(std::string_view word) {
    if (word.size() < 3 || word.find('-') == word.npos) return false;
    const std::vector<std::string_view> pieces = ChordText::PiecesOfRow(word);
    const bool isChord = pieces.size() == 2 && (pieces[1] == "6" || pieces[1] == "7");
    return pieces.size() > 1 && !isChord && std::all_of(pieces.begin(), pieces.end(), IsDegree);
}

/// The triad of the key on a bare degree, as a numeral; of a row alone, where a hyphen that says
/// minor could not be told from one that parts. Other words as they are.
std::string_view NumeralInRow(std::string_view word, const CSignKeyLite& key) {
    constexpr std::array<std::string_view, 7> major{"I", "ii", "iii", "IV", "V", "vi", "viio"};
    constexpr std::array<std::string_view, 7> minor{"i", "iio", "III", "iv", "v", "VI", "VII"};
    if (word.size() != 1 || !IsDegree(word)) return word;
    const auto degree = static_cast<std::size_t>(word[0] - '1');
    return key.mSignKeyType == TSignKeyType_Minor ? minor[degree] : major[degree];
}

/// `ii-V-I`: adds the pieces as words of their own with what is wrong with them. False for a word
/// that is no row, which has a chord in front.
template <class TRead>
bool AddRow(const CNumeralWord& row, TRead read, CNumeralsReading& reading) {
    const std::vector<std::string_view> pieces = ChordText::PiecesOfRow(row.mText);
    if (pieces.size() < 2 || pieces.back().empty()) return false;
    std::size_t column = row.mColumn;
    const char* counted = row.mText.data();
    for (const std::string_view piece : pieces) {
        column += CountUtf8Characters({counted, static_cast<std::size_t>(piece.data() - counted)});
        counted = piece.data();
        CNumeralWord word{std::string(piece), row.mLine, column, {}};
        const std::optional<CTextFault> fault = read(word, true);
        if (fault && column == row.mColumn) return false;
        if (fault) reading.mFaults.push_back(*fault);
        reading.mWords.push_back(std::move(word));
    }
    return true;
}

/// `read` takes the chord of a word, or of a word of a row, or tells what is wrong with it.
template <class TRead>
CNumeralsReading ReadWords(std::string_view text, TRead read) {
    CNumeralsReading reading;
    for (CNumeralWord& word : NumeralWords(text)) {
        if (ChordText::IsSeparator(word.mText)) continue;
        if (!word.IsMark() && !IsWordOfNoChord(word.mText)) {
            const std::optional<CTextFault> fault = read(word, false);
            const bool couldBeRow = fault || IsRowOfDegrees(word.mText);
            if (couldBeRow && AddRow(word, read, reading)) continue;
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
    return ReadWords(text, [&](CNumeralWord& word, bool isOfRow) -> std::optional<CTextFault> {
        const std::string_view wanted = isOfRow ? NumeralInRow(word.mText, key) : word.mText;
        const CNumeralReading numeral = ReadNumeral(wanted, key, options);
        word.mChord = numeral.mChord;
        if (numeral.mFault.empty()) return std::nullopt;
        const auto before = std::string_view(word.mText).substr(0, numeral.mFaultOffset);
        return CTextFault{word.mLine, word.mColumn + CountUtf8Characters(before),
                          std::string(numeral.mFault)};
    });
}

CNumeralsReading ReadChordWords(std::string_view text) {
    return ReadWords(text, [](CNumeralWord& word, bool) -> std::optional<CTextFault> {
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
