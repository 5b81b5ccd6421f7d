// SPDX-License-Identifier: MIT
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/KeyNames.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <span>

namespace brindle {

namespace {

/// The first three characters of a text, a UTF-8 sign counted as the one that it stands for; 0
/// beyond the end.
std::array<char, 3> FirstThreeCharacters(std::string_view text) {
    std::array<char, 3 * kUtf8Sharp.size()> bytes{};
    const std::string_view head = text.substr(0, bytes.size());
    std::copy(head.begin(), head.end(), bytes.begin());
    const auto folded = ConvertUtf8SharpAndFlatToAscii(std::span(bytes).first(head.size()));
    std::array<char, 3> characters{};
    std::copy_n(folded.begin(), std::min(folded.size(), characters.size()), characters.begin());
    return characters;
}

// A to H; H is the German B.
constexpr auto kKeysOfLetters = std::to_array<CKeyEnh>({
    CKeyEnh_A,
    CKeyEnh_B,
    CKeyEnh_C,
    CKeyEnh_D,
    CKeyEnh_E,
    CKeyEnh_F,
    CKeyEnh_G,
    CKeyEnh_B,
});

/// The key of a letter in either case; undefined for any other character.
CKeyEnh KeyOfLetter(char letter, const CChordNamePrefs& prefs) {
    const bool isLowerCase = letter >= 'a' && letter <= 'h';
    const bool isUpperCase = letter >= 'A' && letter <= 'H';
    if (!isLowerCase && !isUpperCase) return CKeyEnh_Undef;
    const auto place = static_cast<std::size_t>(letter - (isLowerCase ? 'a' : 'A'));
    if (place == 1 && prefs.mBForBFlat) return CKeyEnh_Bb;
    return kKeysOfLetters[place];
}

/// An accidental behind a letter and the count of characters it takes.
struct CAccidental {
    TEnh mEnh = TEnh_n;
    std::size_t mLength = 0;
};

CAccidental AccidentalOf(char first, char second) {
    switch (first) {
        case '#':
            return {TEnh_s, 1};
        case 'i':
        case 'I':
            return second == 's' || second == 'S' ? CAccidental{TEnh_s, 2} : CAccidental{};
        case 'x':
            return {TEnh_ss, 1};
        case 'b':
            return second == 'b' ? CAccidental{TEnh_bb, 2} : CAccidental{TEnh_b, 1};
        default:
            return {};
    }
}

}  // namespace

void CKeyEnh::SetFromString(std::string_view text, int* consumed, const CChordNamePrefs& prefs) {
    *this = CKeyEnh_Undef;
    if (consumed != nullptr) *consumed = 0;
    const std::size_t blanks = std::min(text.find_first_not_of(' '), text.size());
    const auto [first, second, third] = FirstThreeCharacters(text.substr(blanks));
    const CKeyEnh letter = KeyOfLetter(first, prefs);
    if (letter.IsUndef()) return;
    *this = letter;
    const CAccidental accidental = AccidentalOf(second, third);
    if (accidental.mLength > 0) {
        // Kept: counted from the letter's key, which may be B flat already: then "Bb" is key 9.
        *this = {FoldIntoOctave(letter.mKeyNr + EnhToSemitone(accidental.mEnh)), accidental.mEnh};
    }
    if (consumed != nullptr) *consumed = static_cast<int>(blanks + 1 + accidental.mLength);
}

}  // namespace brindle
