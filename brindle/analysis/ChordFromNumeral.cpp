// SPDX-License-Identifier: MIT
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/analysis/internal/NumeralTables.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/MakeSensefulEnh.h"

#include <algorithm>

namespace brindle {
namespace {

// No numeral is longer; what is longer is not looked at.
constexpr std::size_t kLongestNumeral = 64;

constexpr int kMostAccidentals = 2;

constexpr std::array<int, 7> kWhiteKeys{0, 2, 4, 5, 7, 9, 11};

struct TReplacement {
    std::string_view mWritten;
    std::string_view mRead;
};

// What people write for the signs of the tables.
constexpr auto kOtherSigns = std::to_array<TReplacement>({
    {"\xC3\xB8", "h"},      // ø
    {"\xC3\x98", "h"},      // Ø
    {"\xC2\xB0", "o"},      // °
    {"\xC2\xBA", "o"},      // º
    {"\xE2\x96\xB3", "^"},  // a white triangle
    {"\xCE\x94", "^"},      // a Delta
    {"maj", "^"},
    {"M", "^"},
    {"dim", "o"},
    {"aug", "+"},
});

std::string Folded(std::string_view text) {
    std::string folded(text);
    ConvertUtf8SharpAndFlatToAscii(folded);
    for (const TReplacement& sign : kOtherSigns) {
        for (std::size_t at = folded.find(sign.mWritten); at != std::string::npos;
             at = folded.find(sign.mWritten, at + 1)) {
            folded.replace(at, sign.mWritten.size(), sign.mRead);
        }
    }
    return folded;
}

// The key so many letters and semitones above another: the third degree of E flat is a G.
CKeyEnh SpelledAbove(const CKeyEnh& from, int letters, int semitones) {
    const TEnh enh = MakeSensefulEnhForKeyNrAssumingCMajor(from.mKeyNr, from.mEnh);
    const int natural = FoldIntoOctave(std::int64_t{from.mKeyNr} - EnhToSemitone(enh));
    const auto letter = std::find(kWhiteKeys.begin(), kWhiteKeys.end(), natural);
    const int keyNr = FoldIntoOctave(std::int64_t{from.mKeyNr} + semitones);
    const int goal =
        kWhiteKeys[static_cast<std::size_t>(letter - kWhiteKeys.begin() + letters) % 7];
    const TEnh spelling = SemitoneToEnh(SmallestKeyIntvlBetween(goal, keyNr));
    return {keyNr, MakeSensefulEnhForKeyNrAssumingCMajor(keyNr, spelling)};
}

/// A degree as it is written, and what is left of the text behind it.
struct TReadDegree {
    TNumeralDegree mDegree{0, 0};
    bool mIsSmall = false;
    bool mIsDigit = false;
    std::string_view mRest;

    [[nodiscard]] bool IsRead() const { return mDegree.mNumber > 0; }
};

// Sharps before the degree, flats as a negative number.
int ReadAccidental(std::string_view& text) {
    int accidental = 0;
    while (!text.empty() && (text.front() == '#' || text.front() == 'b')) {
        accidental += text.front() == '#' ? 1 : -1;
        text.remove_prefix(1);
    }
    return accidental;
}

// The longest Roman number that the text begins with, in large or in small letters.
TReadDegree ReadRomanNumber(std::string_view text) {
    TReadDegree read;
    std::size_t longest = 0;
    for (std::size_t i = 0; i < kRomanNumbers.size(); ++i) {
        const std::string_view number = kRomanNumbers[i];
        if (number.size() <= longest || number.size() > text.size()) continue;
        const bool isSmall = text.front() >= 'a';
        const bool isHere =
            std::equal(number.begin(), number.end(), text.begin(), [&](char large, char typed) {
                return typed == (isSmall ? static_cast<char>(large - 'A' + 'a') : large);
            });
        if (!isHere) continue;
        longest = number.size();
        read = {{static_cast<int>(i) + 1, 0}, isSmall, false, text.substr(longest)};
    }
    return read;
}

TReadDegree ReadDegree(std::string_view text) {
    constexpr std::string_view substitute = "sub";
    const bool isSubstitute = text.starts_with(substitute);
    if (isSubstitute) text.remove_prefix(substitute.size());
    const int accidental = ReadAccidental(text);
    if (text.empty() || accidental < -kMostAccidentals || accidental > kMostAccidentals) return {};
    TReadDegree read;
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

CKeyEnh KeyOfDegree(TNumeralDegree degree, const CSignKeyLite& key) {
    const bool isMinor = key.mSignKeyType == TSignKeyType_Minor;
    const bool isLowInMinor = degree.mNumber == 3 || degree.mNumber == 6 || degree.mNumber == 7;
    if (isMinor && isLowInMinor && degree.mAccidental == -1) degree.mAccidental = 0;
    const auto& degrees = DegreesOf(key.mSignKeyType);
    const auto natural = std::find_if(degrees.begin(), degrees.end(), [&](const auto& candidate) {
        return candidate.mNumber == degree.mNumber && candidate.mAccidental == 0;
    });
    const auto dist = static_cast<int>(natural - degrees.begin());
    return SpelledAbove(key.mRootKeyEnh, degree.mNumber - 1, dist + degree.mAccidental);
}

/// The tones of a numeral above its root, and the tone that is the bass, 0 for the root.
struct TReadTones {
    CSemitones mSemitones;
    int mBassTone = 0;
};

CSemitones TonesOfSign(std::string_view text, bool isMinor) {
    const auto row = std::find_if(kNumeralSigns.begin(), kNumeralSigns.end(),
                                  [&](const TNumeralSign& sign) { return sign.mText == text; });
    if (row == kNumeralSigns.end()) return {};
    return isMinor ? row->mMinor : row->mMajor;
}

TReadTones TonesOfFigure(std::string_view text, bool isMinor) {
    for (const TInversionFigure& figure : kInversionFigures) {
        if (!text.ends_with(figure.mFigure)) continue;
        std::string sign(text.substr(0, text.size() - figure.mFigure.size()));
        if (figure.mHasSeventh) sign += '7';
        const CSemitones tones = TonesOfSign(sign, isMinor);
        const int count = figure.mHasSeventh ? 4 : 3;
        if (tones.size() == count) return {tones, figure.mTone};
    }
    return {};
}

TReadTones ReadTones(const TReadDegree& degree, bool figuresFirst) {
    std::string_view text = degree.mRest;
    bool isMinor = degree.mIsSmall;
    if (degree.mIsDigit && (text.starts_with('-') || text.starts_with('m'))) {
        isMinor = true;
        text.remove_prefix(1);
    }
    const TReadTones plain{TonesOfSign(text, isMinor), 0};
    const TReadTones figured = TonesOfFigure(text, isMinor);
    const bool isFigured = !figured.mSemitones.IsEmpty();
    if (isFigured && (figuresFirst || plain.mSemitones.IsEmpty())) return figured;
    return plain;
}

// The interval of a tone that is counted from below.
int IntvlOfTone(CSemitones semitones, int tone) {
    for (int intvl = 0; intvl < 12; ++intvl) {
        if (semitones.HasIntvl(intvl) && tone-- == 0) return intvl;
    }
    return 0;
}

// The letters from the root to a tone of a triad or a seventh chord: thirds upon thirds.
CKeyEnh BassOfTone(const CKeyEnh& root, const TReadTones& tones) {
    if (tones.mBassTone == 0) return CKeyEnh_Undef;
    return SpelledAbove(root, 2 * tones.mBassTone, IntvlOfTone(tones.mSemitones, tones.mBassTone));
}

/// The texts between the slashes.
struct TPieces {
    std::string_view mNumeral;
    std::string_view mTarget;
    std::string_view mBass;
    bool mIsValid = true;
};

bool IsRoman(std::string_view piece) {
    const TReadDegree degree = ReadDegree(piece);
    return degree.IsRead() && !degree.mIsDigit;
}

TPieces PiecesOf(std::string_view text) {
    TPieces pieces;
    std::size_t slash = text.find('/');
    pieces.mNumeral = text.substr(0, slash);
    while (slash != text.npos) {
        text.remove_prefix(slash + 1);
        slash = text.find('/');
        const std::string_view piece = text.substr(0, slash);
        const bool isTarget = IsRoman(piece) && pieces.mTarget.empty() && pieces.mBass.empty();
        if (piece.empty() || (!isTarget && !pieces.mBass.empty())) pieces.mIsValid = false;
        (isTarget ? pieces.mTarget : pieces.mBass) = piece;
    }
    return pieces;
}

// "3", "b7" or "Eb".
CKeyEnh ReadBass(std::string_view text, const CSignKeyLite& key) {
    const TReadDegree degree = ReadDegree(text);
    if (degree.IsRead()) {
        const bool isBass = degree.mIsDigit && degree.mRest.empty();
        return isBass ? KeyOfDegree(degree.mDegree, key) : CKeyEnh_Undef;
    }
    if (text.front() < 'A' || text.front() > 'G') return CKeyEnh_Undef;
    CKeyEnh bass;
    int consumed = 0;
    bass.SetFromString(text, &consumed, ChordNamePrefsNonUTF8);
    return static_cast<std::size_t>(consumed) == text.size() ? bass : CKeyEnh_Undef;
}

// The key in which the numeral before the slash counts. It is major whatever the target, so that
// viio is the leading tone of a minor chord, too.
std::optional<CSignKeyLite> KeyOfTarget(std::string_view target, const CSignKeyLite& key) {
    if (target.empty()) return key;
    const TReadDegree degree = ReadDegree(target);
    if (!degree.mRest.empty()) return std::nullopt;
    return CSignKeyLite(KeyOfDegree(degree.mDegree, key), TSignKeyType_Major);
}

}  // namespace

std::optional<CChordLite> ChordFromNumeral(std::string_view text, const CSignKeyLite& key,
                                           const TNumeralOptions& options) {
    if (key.IsUndef() || text.size() > kLongestNumeral) return std::nullopt;
    const std::string folded = Folded(text);
    const TPieces pieces = PiecesOf(folded);
    const TReadDegree degree = ReadDegree(pieces.mNumeral);
    const auto keyOfTarget = KeyOfTarget(pieces.mTarget, key);
    if (!pieces.mIsValid || !degree.IsRead() || !keyOfTarget) return std::nullopt;
    const TReadTones tones = ReadTones(degree, options.mFigures);
    if (tones.mSemitones.IsEmpty()) return std::nullopt;
    const CKeyEnh root = KeyOfDegree(degree.mDegree, *keyOfTarget);
    CKeyEnh bass = BassOfTone(root, tones);
    if (!pieces.mBass.empty()) {
        bass = ReadBass(pieces.mBass, key);
        if (bass.IsUndef()) return std::nullopt;
    }
    return CChordLite(root, bass, tones.mSemitones);
}

}  // namespace brindle
