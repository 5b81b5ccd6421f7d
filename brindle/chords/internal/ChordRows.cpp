// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/ChordRows.h"

#include "brindle/platform/Ascii.h"

#include <algorithm>
#include <array>
#include <cstddef>

namespace brindle::ChordText {

namespace {

// Longer ones stand before what they begin with. Of hyphens there are the typed one, the two of
// printers, the minus sign and two dashes.
constexpr auto kSeparators = std::to_array<std::string_view>(
    {"->", "=>", "-", "\u2010", "\u2011", "\u2212", "–", "—", "→", "⇒", "➜", ">", ",", ";"});

/// The bytes of the separator that a text begins with; 0 without one.
std::size_t LengthOfSeparator(std::string_view text) {
    const auto* const found =
        std::find_if(kSeparators.begin(), kSeparators.end(),
                     [&](std::string_view separator) { return text.starts_with(separator); });
    return found == kSeparators.end() ? 0 : found->size();
}

/// Whether the hyphen at `pos` is part of the chord before it: `C-7`, `V4-3`, but not `1-5`.
bool IsWithinChord(std::string_view chord, std::size_t pos) {
    // No chord has more than two signs in front, and no longer row of them is searched each time.
    const std::size_t letter = std::min(chord.substr(0, 3).find_first_not_of("b#"), chord.size());
    const bool hasLetter = letter < pos && Ascii::IsLetter(chord[letter]);
    return hasLetter && chord[pos] == '-' && pos + 1 < chord.size() &&
           Ascii::IsDigit(chord[pos + 1]);
}

}  // namespace

bool IsSeparator(std::string_view word) {
    return !word.empty() && LengthOfSeparator(word) == word.size();
}

std::string_view WithoutCommasBehind(std::string_view word) {
    while (word.size() > 1 && (word.back() == ',' || word.back() == ';')) word.remove_suffix(1);
    return word;
}

std::vector<std::string_view> PiecesOfRow(std::string_view word) {
    word = WithoutCommasBehind(word);
    std::vector<std::string_view> pieces;
    std::size_t begin = 0;
    for (std::size_t pos = 0; pos < word.size();) {
        const std::size_t length = LengthOfSeparator(word.substr(pos));
        if (length == 0 || IsWithinChord(word.substr(begin), pos - begin)) {
            ++pos;
            continue;
        }
        // `C--G` is `C-G`.
        if (pos > begin || pieces.empty()) pieces.push_back(word.substr(begin, pos - begin));
        begin = pos += length;
    }
    pieces.push_back(word.substr(begin));
    return pieces;
}

}  // namespace brindle::ChordText
