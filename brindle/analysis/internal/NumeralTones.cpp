// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/NumeralTones.h"

#include "brindle/analysis/RomanNumeral.h"
#include "brindle/analysis/internal/NumeralDegree.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/platform/Ascii.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <optional>
#include <string>

namespace brindle {
namespace {

constexpr int kMinorSeventh = 10;
constexpr int kMajorSeventh = 11;

// What is added as a number counts as in chord symbols: 7 is a minor seventh.
constexpr std::array<int, 14> kSemitonesOfNumber{-1, 0, 2, 4, 5, 7, 9, 10, 0, 2, 4, 5, 7, 9};
//                                    number:         1  2  3  4  5  6  7   8  9 10 11 12 13

int TakeAccidentals(std::string_view& text) {
    int accidental = 0;
    while (!text.empty() && (text.front() == '#' || text.front() == 'b')) {
        accidental += text.front() == '#' ? 1 : -1;
        text.remove_prefix(1);
    }
    return accidental;
}

// 1 to 19, 0 for no number.
int TakeNumber(std::string_view& text) {
    const auto digitAt = [&](std::size_t ix) {
        return ix < text.size() && Ascii::IsDigit(text[ix]) ? text[ix] - '0' : -1;
    };
    const int first = digitAt(0);
    if (first < 1) return 0;
    const bool hasTwo = first == 1 && digitAt(1) >= 0;
    const int number = hasTwo ? 10 + digitAt(1) : first;
    text.remove_prefix(hasTwo ? 2 : 1);
    return number;
}

// An accidental changes the number as in chord symbols, too: b7 is the same as 7.
int SemitonesOfNumber(int number, int accidental) {
    const int semitones = kSemitonesOfNumber[static_cast<std::size_t>(number)] + accidental;
    return number == 7 && accidental < 0 ? semitones + 1 : semitones;
}

int StepOfNumber(int number) {
    return (number - 1) % 7 + 1;
}

/// The signs between a degree and its figure.
struct CNumeralQuality {
    bool mDiminished = false;
    bool mHalfDiminished = false;
    bool mAugmented = false;
    bool mMajorSeventh = false;
    bool mDominant = false;

    [[nodiscard]] bool SaysSeventh() const {
        return mDiminished || mHalfDiminished || mMajorSeventh || mDominant;
    }
};

CNumeralQuality TakeQuality(std::string_view& tail) {
    CNumeralQuality quality;
    for (; !tail.empty(); tail.remove_prefix(1)) {
        switch (tail.front()) {
            case 'o':
                quality.mDiminished = true;
                break;
            case 'h':
                quality.mHalfDiminished = true;
                break;
            case '+':
                quality.mAugmented = true;
                break;
            case '^':
                quality.mMajorSeventh = true;
                break;
            case 'd':
                quality.mDominant = true;
                break;
            default:
                return quality;
        }
    }
    return quality;
}

const CNumeralFigure* FigureOf(std::string_view text) {
    constexpr std::size_t longest = 8;
    std::array<char, longest> digits;
    std::size_t count = 0;
    for (const char c : text) {
        if (c == '/') continue;
        const bool isOfFigure = Ascii::IsDigit(c) || c == '-';
        if (!isOfFigure || count == longest) return nullptr;
        digits[count++] = c;
    }
    const std::string_view figure(digits.data(), count);
    const auto row =
        std::find_if(kNumeralFigures.begin(), kNumeralFigures.end(),
                     [&](const CNumeralFigure& known) { return known.mText == figure; });
    return row == kNumeralFigures.end() ? nullptr : &*row;
}

int ThirdOf(const CNumeralRoot& root, const CNumeralQuality& quality) {
    if (quality.mDominant) return 4;
    return root.mIsSmall || quality.mDiminished || quality.mHalfDiminished ? 3 : 4;
}

int FifthOf(const CNumeralQuality& quality) {
    if (quality.mDiminished || quality.mHalfDiminished) return 6;
    return quality.mAugmented ? 8 : 7;
}

int SeventhOf(const CNumeralRoot& root, const CNumeralQuality& quality, bool byKey) {
    if (quality.mMajorSeventh) return kMajorSeventh;
    if (quality.mDiminished) return 9;
    // The sevenths of small numerals are minor in every key.
    const bool isOfKey = byKey && !root.mIsSmall && !quality.SaysSeventh();
    return isOfKey ? IntvlInKey(root, 7) : kMinorSeventh;
}

bool HasSeventh(TFigureKind kind) {
    return kind == TFigure_Seventh || kind == TFigure_Ninth || kind == TFigure_Eleventh ||
           kind == TFigure_Thirteenth || kind == TFigure_SeventhFourth;
}

bool HasNinth(TFigureKind kind) {
    return kind == TFigure_Ninth || kind == TFigure_Eleventh || kind == TFigure_Thirteenth ||
           kind == TFigure_AddedNinth;
}

bool HasFourthForThird(TFigureKind kind) {
    return kind == TFigure_Fourth || kind == TFigure_SeventhFourth || kind == TFigure_SixthFourth;
}

// The tones of a figure in the root position.
CSemitones TonesOfKind(TFigureKind kind, const CNumeralRoot& root, const CNumeralQuality& quality,
                       bool byKey) {
    const auto tension = [&](int step, int usual) {
        return byKey ? IntvlInKey(root, step) : usual;
    };
    CSemitones tones{0};
    // The sixth that falls to the fifth is that of the key in all texts: C above E in A minor.
    const bool hasSixth = kind == TFigure_Sixth || kind == TFigure_SixthFourth;
    tones.SetSemitone(hasSixth ? IntvlInKey(root, 6) : FifthOf(quality), true);
    if (HasFourthForThird(kind)) {
        tones.SetSemitone(tension(4, 5), true);
    } else if (kind == TFigure_Second) {
        tones.SetSemitone(tension(2, 2), true);
    } else {
        tones.SetSemitone(ThirdOf(root, quality), true);
    }
    if (HasSeventh(kind)) tones.SetSemitone(SeventhOf(root, quality, byKey), true);
    if (HasNinth(kind)) tones.SetSemitone(tension(2, 2), true);
    const bool hasEleventh = kind == TFigure_Eleventh || kind == TFigure_Thirteenth;
    if (hasEleventh) tones.SetSemitone(tension(4, 5), true);
    if (kind == TFigure_Thirteenth) tones.SetSemitone(tension(6, 9), true);
    return tones;
}

// Half diminished without a figure is a seventh chord.
CReadTones TonesOfFigure(std::string_view tail, const CNumeralRoot& root, bool byKey) {
    const CNumeralQuality quality = TakeQuality(tail);
    const CNumeralFigure* figure = FigureOf(tail);
    if (figure == nullptr || (tail.empty() && quality.mDominant)) return {};
    TFigureKind kind = figure->mKind;
    if (tail.empty() && (quality.mHalfDiminished || quality.mMajorSeventh)) kind = TFigure_Seventh;
    CReadTones tones{TonesOfKind(kind, root, quality, byKey), figure->mBassStep};
    if (figure->mWithout != 0) {
        tones.mSemitones.EraseIntvl(SemitoneOfStep(tones.mSemitones, figure->mWithout));
    }
    return tones;
}

CSemitones TonesOfSign(std::string_view text, bool isSmall) {
    const auto row = std::find_if(kNumeralSigns.begin(), kNumeralSigns.end(),
                                  [&](const CNumeralSign& sign) { return sign.mText == text; });
    if (row == kNumeralSigns.end()) return {};
    return isSmall ? row->mMinor : row->mMajor;
}

// The longest sign that the text begins with, taken from it.
CSemitones TakeSign(std::string_view& text, bool isSmall) {
    const CNumeralSign* longest = &kNumeralSigns.front();
    for (const CNumeralSign& sign : kNumeralSigns) {
        const CSemitones tones = isSmall ? sign.mMinor : sign.mMajor;
        if (tones.IsEmpty() || sign.mText.size() <= longest->mText.size()) continue;
        if (text.starts_with(sign.mText)) longest = &sign;
    }
    text.remove_prefix(longest->mText.size());
    return isSmall ? longest->mMinor : longest->mMajor;
}

bool TakeOmission(std::string_view& text, CSemitones& tones) {
    const int number = TakeNumber(text);
    const int semitone = number > 0 ? SemitoneOfStep(tones, StepOfNumber(number)) : -1;
    tones.SetSemitone(semitone, false);
    return semitone >= 0;
}

bool TakeAddition(std::string_view& text, CSemitones& tones) {
    const bool isMajorSeventh = Ascii::TakePrefix(text, "^");
    const int accidental = TakeAccidentals(text);
    const int number = TakeNumber(text);
    if (number < 2 || number > 13) return false;
    if (isMajorSeventh && number != 7) return false;
    tones.AddIntvl(isMajorSeventh ? kMajorSeventh : SemitonesOfNumber(number, accidental));
    return true;
}

// An altered tone stands for the plain one: b5 for the fifth, #11 for the eleventh of a 13.
bool TakeAlteration(std::string_view& text, CSemitones& tones) {
    if (text.front() != 'b' && text.front() != '#') return false;
    std::string_view number = text;
    TakeAccidentals(number);
    switch (TakeNumber(number)) {
        case 5:
            tones.SetSemitone(7, false);
            break;
        case 9:
            tones.SetSemitone(2, false);
            break;
        case 11:
            tones.SetSemitone(5, false);
            break;
        case 13:
            tones.SetSemitone(9, false);
            break;
        default:
            break;
    }
    return TakeAddition(text, tones);
}

// A sign of the table and alterations behind it: 7#11, ^7no5, 7(b9,b13).
CSemitones TonesOfAlterations(std::string_view text, bool isSmall) {
    CSemitones tones = TakeSign(text, isSmall);
    while (!text.empty()) {
        if (Ascii::TakePrefix(text, "(") || Ascii::TakePrefix(text, ")") ||
            Ascii::TakePrefix(text, ","))
            continue;
        const bool isTaken = Ascii::TakePrefix(text, "no")    ? TakeOmission(text, tones)
                             : Ascii::TakePrefix(text, "add") ? TakeAddition(text, tones)
                                                              : TakeAlteration(text, tones);
        if (!isTaken) return {};
    }
    return tones;
}

// As behind the root of a chord symbol, in any of the ways that people write that. Digits alone and
// more Roman letters are for the numeral to know.
CSemitones TonesOfSymbol(std::string_view text, bool isSmall) {
    const bool isDigits = text.find_first_not_of("0123456789") == text.npos;
    if (isDigits || text.find_first_of("IViv") == 0) return {};
    std::string symbol = isSmall ? "Cm" : "C";
    symbol += text;
    const CChordTextReading reading = ReadChordText(symbol);
    const bool isChord = reading.mKind == TChordText_Chord && !reading.mChord.HasBassNote() &&
                         reading.mChord.mRootKeyEnh == CKeyEnh{0, TEnh_n};
    return isChord ? reading.mChord.mSemitones : CSemitones_Undef;
}

bool IsMinorSign(std::string_view tail) {
    if (tail.starts_with('m')) return true;
    return tail.starts_with('-') && (tail.size() == 1 || tail[1] != '-');
}

int CountOf(CSemitones semitones, int from, int to) {
    int count = 0;
    for (int i = from; i <= to; ++i) count += semitones.HasIntvl(i) ? 1 : 0;
    return count;
}

}  // namespace

int IntvlInKey(const CNumeralRoot& root, int step) {
    const CNumeralDegree degree{(root.mDegree.mNumber - 1 + step - 1) % 7 + 1, 0};
    return FoldIntoOctave(std::int64_t{SemitonesOfDegree(degree, root.mKeyType)} -
                          SemitonesOfDegree(root.mDegree, root.mKeyType));
}

int StepOfSemitone(CSemitones semitones, int semitone) {
    const auto has = [&](int intvl) { return semitones.HasIntvl(intvl); };
    switch (semitone) {
        case 0:
            return 1;
        case 1:
        case 2:
            return 2;
        case 3:
            return has(4) ? 2 : 3;
        case 4:
            return 3;
        case 5:
            return 4;
        case 6:
            return has(7) ? 4 : 5;
        case 7:
            return 5;
        case 8:
            return has(7) || has(6) ? 6 : 5;
        case 9:
            return has(3) && has(6) && CountOf(semitones, 7, 11) == 1 ? 7 : 6;
        default:
            return 7;
    }
}

int SemitoneOfStep(CSemitones semitones, int step) {
    for (int semitone = 0; semitone < 12; ++semitone) {
        if (semitones.HasIntvl(semitone) && StepOfSemitone(semitones, semitone) == step) {
            return semitone;
        }
    }
    return -1;
}

CReadTones TonesOfTail(std::string_view tail, const CNumeralRoot& given,
                       const CNumeralOptions& options) {
    CNumeralRoot root = given;
    if (IsMinorSign(tail)) {
        root.mIsSmall = true;
        tail.remove_prefix(1);
    }
    const CReadTones figured = TonesOfFigure(tail, root, options.mByKey);
    const bool isFigured = !figured.mSemitones.IsEmpty();
    if (isFigured && (options.mFigures || options.mByKey)) return figured;
    const CSemitones sign = TonesOfSign(tail, root.mIsSmall);
    if (!sign.IsEmpty()) return {sign};
    if (isFigured) return figured;
    const CSemitones altered = TonesOfAlterations(tail, root.mIsSmall);
    if (!altered.IsEmpty()) return {altered};
    return {TonesOfSymbol(tail, root.mIsSmall)};
}

bool ApplyGroup(std::string_view& group, const CNumeralRoot& root, CReadTones& tones) {
    while (!group.empty()) {
        const bool isOmitted = Ascii::TakePrefix(group, "no");
        const bool isAdded = !isOmitted && Ascii::TakePrefix(group, "add");
        std::string_view rest = group;
        const int accidental = TakeAccidentals(rest);
        const int number = TakeNumber(rest);
        const bool isNumber = number > 0 && (isAdded || isOmitted || number <= 13) &&
                              (rest.empty() || !Ascii::IsDigit(rest.front()));
        if (!isNumber || (isOmitted && accidental != 0)) return false;
        const int step = StepOfNumber(number);
        const int present = SemitoneOfStep(tones.mSemitones, step);
        if (isOmitted) {
            tones.mSemitones.SetSemitone(present, false);
        } else if (isAdded) {
            tones.mSemitones.AddIntvl(IntvlInKey(root, step) + accidental);
        } else if (present >= 0) {
            tones.mSemitones.SetSemitone(present, false);
            tones.mSemitones.AddIntvl(present + accidental);
        } else {
            tones.mSemitones.AddIntvl(SemitonesOfNumber(number, accidental));
        }
        group = rest;
        while (Ascii::TakePrefix(group, ",") || Ascii::TakePrefix(group, " ")) {
        }
    }
    return true;
}

}  // namespace brindle
