// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/ChordRows.h"

#include <algorithm>
#include <array>
#include <cstddef>

namespace brindle::ChordText {

namespace {

// `->` stands before the hyphen that it begins with.
constexpr auto kSeparators =
    std::to_array<std::string_view>({"->", "-", "–", "—", "→", ">", ",", ";"});

/// The bytes of the separator that a text begins with; 0 without one.
std::size_t LengthOfSeparator(std::string_view text) {
    const auto* const found =
        std::find_if(kSeparators.begin(), kSeparators.end(),
                     [&](std::string_view separator) { return text.starts_with(separator); });
    return found == kSeparators.end() ? 0 : found->size();
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
        if (length > 0) {
            pieces.push_back(word.substr(begin, pos - begin));
            begin = pos + length;
        }
        pos += std::max<std::size_t>(length, 1);
    }
    pieces.push_back(word.substr(begin));
    return pieces;
}

}  // namespace brindle::ChordText
