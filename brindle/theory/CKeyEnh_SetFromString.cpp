// SPDX-License-Identifier: MIT
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/KeyNames.h"

#include <array>
#include <cstddef>

namespace brindle {

namespace {

/// Walks over a text as if its UTF-8 signs were "#" and "b", without copying it.
class FoldedReader {
public:
    explicit FoldedReader(std::string_view text) : mRest(text) {}

    /// Count of characters walked over, a sign counted as one.
    [[nodiscard]] int Used() const { return mUsed; }
    [[nodiscard]] bool IsAtEnd() const { return mRest.empty(); }

    /// The next character; 0 at the end.
    [[nodiscard]] char Peek() const {
        if (mRest.empty()) return '\0';
        if (StartsWith(kUtf8Sharp)) return '#';
        return StartsWith(kUtf8Flat) ? 'b' : mRest.front();
    }
    void Drop() {
        const bool isSign = StartsWith(kUtf8Sharp) || StartsWith(kUtf8Flat);
        mRest.remove_prefix(isSign ? kUtf8Sharp.size() : 1);
        ++mUsed;
    }
    /// The next character but one; 0 if there is none.
    [[nodiscard]] char PeekSecond() const {
        if (IsAtEnd()) return '\0';
        FoldedReader second = *this;
        second.Drop();
        return second.Peek();
    }

private:
    [[nodiscard]] bool StartsWith(std::string_view sign) const { return mRest.starts_with(sign); }

    std::string_view mRest;
    int mUsed = 0;
};

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
struct TAccidental {
    TEnh mEnh = TEnh_n;
    int mLength = 0;
};

TAccidental AccidentalAt(const FoldedReader& reader) {
    const char second = reader.PeekSecond();
    switch (reader.Peek()) {
        case '#':
            return {TEnh_s, 1};
        case 'i':
        case 'I':
            return second == 's' || second == 'S' ? TAccidental{TEnh_s, 2} : TAccidental{};
        case 'x':
            return {TEnh_ss, 1};
        case 'b':
            return second == 'b' ? TAccidental{TEnh_bb, 2} : TAccidental{TEnh_b, 1};
        default:
            return {};
    }
}

}  // namespace

void CKeyEnh::SetFromString(std::string_view text, int* consumed, const CChordNamePrefs& prefs) {
    *this = CKeyEnh_Undef;
    if (consumed != nullptr) *consumed = 0;
    FoldedReader reader(text);
    while (reader.Peek() == ' ') reader.Drop();
    const CKeyEnh letter = KeyOfLetter(reader.Peek(), prefs);
    if (letter.IsUndef()) return;
    reader.Drop();
    *this = letter;
    const TAccidental accidental = AccidentalAt(reader);
    if (accidental.mLength > 0) {
        // Kept: counted from the letter's key, which may be B flat already: then "Bb" is key 9.
        *this = {FoldIntoOctave(letter.mKeyNr + EnhToSemitone(accidental.mEnh)), accidental.mEnh};
    }
    if (consumed != nullptr) *consumed = reader.Used() + accidental.mLength;
}

}  // namespace brindle
