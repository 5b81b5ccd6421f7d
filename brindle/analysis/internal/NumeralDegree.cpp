// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/NumeralDegree.h"

#include "brindle/platform/Ascii.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/MakeSensefulEnh.h"

#include <algorithm>

namespace brindle {
namespace {

constexpr int kMostAccidentals = 2;

constexpr const std::array<int, 7>& kMajorDegrees = kNaturalKeyNrs;
constexpr std::array<int, 7> kMinorDegrees{0, 2, 3, 5, 7, 8, 10};

// Sharps before the degree, flats as a negative number. A minus is a flat.
int TakeSignsOfDegree(std::string_view& text) {
    int accidental = 0;
    while (!text.empty() && (text.front() == '#' || text.front() == 'b' || text.front() == '-')) {
        accidental += text.front() == '#' ? 1 : -1;
        text.remove_prefix(1);
    }
    return accidental;
}

// The longest Roman number that the text begins with, in large or in small letters.
CReadDegree ReadRomanNumber(std::string_view text) {
    CReadDegree read;
    std::size_t longest = 0;
    for (std::size_t i = 0; i < kRomanNumbers.size(); ++i) {
        const std::string_view number = kRomanNumbers[i];
        if (number.size() <= longest || number.size() > text.size()) continue;
        const bool isSmall = text.front() >= 'a';
        const bool isHere =
            std::equal(number.begin(), number.end(), text.begin(), [&](char large, char typed) {
                return typed == (isSmall ? Ascii::ToLower(large) : large);
            });
        if (!isHere) continue;
        longest = number.size();
        read = {{static_cast<int>(i) + 1, 0}, isSmall, false, text.substr(longest)};
    }
    return read;
}

// The index of the letter, 0 for C.
int LetterWrittenFor(const CKeyEnh& keyEnh) {
    const TEnh enh = MakeSensefulEnhForKeyNrAssumingCMajor(keyEnh.mKeyNr, keyEnh.mEnh);
    const int natural = FoldIntoOctave(std::int64_t{keyEnh.mKeyNr} - EnhToSemitone(enh));
    const auto letter = std::find(kMajorDegrees.begin(), kMajorDegrees.end(), natural);
    return static_cast<int>(letter - kMajorDegrees.begin()) % 7;
}

}  // namespace

CReadDegree ReadDegree(std::string_view text) {
    constexpr std::string_view substitute = "sub";
    const bool isSubstitute = text.starts_with(substitute);
    if (isSubstitute) text.remove_prefix(substitute.size());
    const int accidental = TakeSignsOfDegree(text);
    if (text.empty() || accidental < -kMostAccidentals || accidental > kMostAccidentals) return {};
    CReadDegree read;
    if (text.front() >= '1' && text.front() <= '7') {
        read = {{text.front() - '0', 0}, false, true, text.substr(1)};
    } else {
        read = ReadRomanNumber(text);
    }
    if (!read.IsRead()) return {};
    read.mDegree.mAccidental = accidental;
    if (isSubstitute) {
        // A tritone away from the dominant.
        if (read.mDegree.mNumber != 5 || accidental != 0 || read.mIsSmall) return {};
        read.mDegree = {2, -1};
    }
    return read;
}

CNumeralDegree FoldMinorFlat(CNumeralDegree degree, TSignKeyType type) {
    const bool isLowInMinor = degree.mNumber == 3 || degree.mNumber == 6 || degree.mNumber == 7;
    if (type == TSignKeyType_Minor && isLowInMinor && degree.mAccidental == -1) {
        degree.mAccidental = 0;
    }
    return degree;
}

int SemitonesOfDegree(CNumeralDegree degree, TSignKeyType type) {
    const auto& degrees = type == TSignKeyType_Minor ? kMinorDegrees : kMajorDegrees;
    return degrees[static_cast<std::size_t>(degree.mNumber - 1)] + degree.mAccidental;
}

CKeyEnh SpelledAbove(const CKeyEnh& from, int letters, int semitones) {
    const int keyNr = FoldIntoOctave(std::int64_t{from.mKeyNr} + semitones);
    const auto letter = static_cast<std::size_t>(LetterWrittenFor(from) + letters + 7) % 7;
    const TEnh spelling = SemitoneToEnh(SmallestKeyIntvlBetween(kMajorDegrees[letter], keyNr));
    return {keyNr, MakeSensefulEnhForKeyNrAssumingCMajor(keyNr, spelling)};
}

int LettersBetween(const CKeyEnh& from, const CKeyEnh& to) {
    return (LetterWrittenFor(to) - LetterWrittenFor(from) + 7) % 7;
}

CKeyEnh NoteOfDegree(CNumeralDegree degree, const CSignKeyLite& key) {
    return SpelledAbove(key.mRootKeyEnh, degree.mNumber - 1,
                        SemitonesOfDegree(degree, key.mSignKeyType));
}

}  // namespace brindle
