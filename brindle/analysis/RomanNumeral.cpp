// SPDX-License-Identifier: MIT
#include "brindle/analysis/RomanNumeral.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/internal/AugmentedSixths.h"
#include "brindle/analysis/internal/KeyChords.h"
#include "brindle/analysis/internal/NumeralDegree.h"
#include "brindle/analysis/internal/NumeralSign.h"
#include "brindle/analysis/internal/NumeralText.h"
#include "brindle/analysis/internal/NumeralTones.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/MakeSensefulEnh.h"

#include <algorithm>
#include <array>
#include <cstdint>

namespace brindle {
namespace {

constexpr int kDistOfDominant = 7;

int IntvlBetween(const CKeyEnh& from, const CKeyEnh& to) {
    return FoldIntoOctave(std::int64_t{to.mKeyNr} - from.mKeyNr);
}

int DistToTonic(const CKeyEnh& keyEnh, const CSignKeyLite& key) {
    return IntvlBetween(key.mRootKeyEnh, keyEnh);
}

CNumeralDegree DegreeAt(int dist, const CSignKeyLite& key) {
    return DegreesOf(key.mSignKeyType)[static_cast<std::size_t>(dist)];
}

std::string DegreeText(CNumeralDegree degree, bool isSmall, bool inDigits) {
    std::string text;
    if (inDigits) {
        AppendAccidentals(text, degree.mAccidental);
        text += static_cast<char>('0' + degree.mNumber);
    } else {
        AppendDegree(text, degree, isSmall);
    }
    return text;
}

/// The degree that a chord is written as, in its key or in that of the degree it is applied to.
struct CWrittenDegree {
    std::string mText;
    CNumeralRoot mRoot;
    int mNumber;          ///< of the root in the key, 1 to 7, whatever its accidental
    std::string mTarget;  ///< "/ii", empty in the key
};

/// What a chord is to the chord that follows it.
struct CApplied {
    std::string_view mNumeral;
    CNumeralDegree mDegree;
};

constexpr CApplied kDominant{"V", {5, 0}};
constexpr CApplied kSubstitute{"subV", {2, -1}};
constexpr CApplied kLeadingTone{"vii", {7, 0}};

const CApplied* AppliedBy(const CChordLite& chord, const CSignKeyLite& key, int target) {
    const TKeyChordClass chordClass = KeyChordClassOf(chord.mSemitones);
    const int dist = DistToTonic(chord.mRootKeyEnh, key);
    const int up = FoldIntoOctave(target - dist);
    if (chordClass == TKeyChordClass_Dim) return up == 1 ? &kLeadingTone : nullptr;
    if (chordClass != TKeyChordClass_Dom || dist == kDistOfDominant) return nullptr;
    if (up == 5) return &kDominant;
    return up == 11 ? &kSubstitute : nullptr;
}

// The degree as it is written in minor where the sign or the option would raise it: a flat stands
// for the sixth and seventh of the scale.
CNumeralDegree HeldInMinor(CNumeralDegree degree, CSemitones semitones, const CSignKeyLite& key,
                           const CNumeralOptions& options) {
    if (key.mSignKeyType != TSignKeyType_Minor || degree.mAccidental != 0) return degree;
    if (!HasSmallNumeral(semitones) || degree.mNumber < 6) return degree;
    const TKeyChordClass chordClass = KeyChordClassOf(semitones);
    const bool isDiminished = chordClass == TKeyChordClass_HDim || chordClass == TKeyChordClass_Dim;
    const bool isRaisedBySign = isDiminished && (degree.mNumber == 7 || options.mFigures);
    if (isRaisedBySign || options.mByKey) degree.mAccidental = -1;
    return degree;
}

CWrittenDegree OwnDegree(const CChordLite& chord, const CSignKeyLite& key,
                         const CNumeralOptions& options) {
    const bool isSmall = HasSmallNumeral(chord.mSemitones);
    const CNumeralDegree degree = DegreeAt(DistToTonic(chord.mRootKeyEnh, key), key);
    CNumeralDegree held = degree;
    if (!options.mNashville) held = HeldInMinor(degree, chord.mSemitones, key, options);
    std::string text = DegreeText(held, isSmall, options.mNashville);
    const TKeyChordClass chordClass = KeyChordClassOf(chord.mSemitones);
    const bool isMinor = chordClass == TKeyChordClass_Min || chordClass == TKeyChordClass_Min7;
    if (options.mNashville && isMinor) text += '-';
    return {text, {degree, key.mSignKeyType, isSmall}, degree.mNumber, {}};
}

CWrittenDegree DegreeBefore(const CChordLite* next, const CChordLite& chord,
                            const CSignKeyLite& key, const CNumeralOptions& options) {
    if (next == nullptr || next->IsUndef() || options.mNashville) {
        return OwnDegree(chord, key, options);
    }
    const int target = DistToTonic(next->mRootKeyEnh, key);
    const CApplied* applied = nullptr;
    if (target != 0 && key.Semitones().HasIntvl(target)) applied = AppliedBy(chord, key, target);
    if (applied == nullptr) return OwnDegree(chord, key, options);
    const bool isSmall = HasSmallNumeral(next->mSemitones);
    const CNumeralDegree degree = DegreeAt(target, key);
    const CNumeralDegree held = HeldInMinor(degree, next->mSemitones, key, options);
    const TSignKeyType type = isSmall ? TSignKeyType_Minor : TSignKeyType_Major;
    return {std::string(applied->mNumeral),
            {applied->mDegree, type, HasSmallNumeral(chord.mSemitones)},
            (degree.mNumber + applied->mDegree.mNumber - 2) % 7 + 1,
            "/" + DegreeText(held, isSmall, false)};
}

// The sign with the figure of the bass in it; empty where the figures do not tell the bass.
std::string SignWithFigure(std::string_view sign, CSemitones semitones, int bass) {
    constexpr auto triads = std::to_array<std::string_view>({"", "o", "+"});
    const bool isTriad = std::find(triads.begin(), triads.end(), sign) != triads.end();
    const bool hasSeventh = sign.ends_with('7');
    if ((!isTriad && !hasSeventh) || !semitones.HasIntvl(bass)) return {};
    const int step = StepOfSemitone(semitones, bass);
    const TFigureKind kind = hasSeventh ? TFigure_Seventh : TFigure_Triad;
    for (const CNumeralFigure& figure : kNumeralFigures) {
        if (figure.mKind != kind || figure.mBassStep != step || step == 1) continue;
        if (hasSeventh) sign.remove_suffix(1);
        return std::string(sign) += figure.mText;
    }
    return {};
}

// A minor seventh that is not that of the key has a d where the key would tell the seventh.
std::string_view SignByKey(std::string_view sign, const CNumeralRoot& root) {
    if (root.mIsSmall || IntvlInKey(root, 7) == 10) return sign;
    if (sign == "7") return "d7";
    return sign == "+7" ? "+d7" : sign;
}

std::string WithPrintedSigns(std::string_view sign) {
    std::string printed;
    for (const char c : sign) {
        if (c == 'h') {
            printed += "\xC3\xB8";  // ø
        } else if (c == 'o') {
            printed += "\xC2\xB0";  // °
        } else {
            printed += c;
        }
    }
    return printed;
}

// Letters to a tone above the root when nothing tells its spelling.
constexpr std::array<int, 12> kUsualLetters{0, 1, 1, 2, 2, 3, 4, 4, 5, 5, 6, 6};

bool IsSpelled(const CKeyEnh& keyEnh) {
    return IsSensefulEnhForKeyNr(keyEnh.mKeyNr, keyEnh.mEnh);
}

// Letters from the root to the bass as it is spelled; the usual ones of its sound if it is not.
int LettersToBass(const CChordLite& chord) {
    const bool isSpelled = IsSpelled(chord.mRootKeyEnh) && IsSpelled(chord.mBassKeyEnh);
    if (isSpelled) return LettersBetween(chord.mRootKeyEnh, chord.mBassKeyEnh);
    const int intvl = IntvlBetween(chord.mRootKeyEnh, chord.mBassKeyEnh);
    return kUsualLetters[static_cast<std::size_t>(intvl)];
}

// A figure would read the E sharp of G7/E# as F.
bool IsSpelledOtherwise(const CChordLite& chord, int intvl) {
    const bool isSpelled = IsSpelled(chord.mRootKeyEnh) && IsSpelled(chord.mBassKeyEnh);
    return isSpelled && LettersToBass(chord) + 1 != StepOfSemitone(chord.mSemitones, intvl);
}

// The degree of the bass, as many letters above the root as it is spelled; the usual one of its
// sound where that takes more than two accidentals. Counted in degrees, so that it is the same in
// all keys.
CNumeralDegree BassDegree(const CChordLite& chord, int rootNumber, const CSignKeyLite& key) {
    const int letters = LettersToBass(chord);
    CNumeralDegree degree{(rootNumber - 1 + letters) % 7 + 1, 0};
    const int dist = DistToTonic(chord.mBassKeyEnh, key);
    degree.mAccidental = SmallestKeyIntvlBetween(SemitonesOfDegree(degree, key.mSignKeyType), dist);
    return degree.mAccidental < -2 || degree.mAccidental > 2 ? DegreeAt(dist, key) : degree;
}

/// What stands behind the degree, and the bass behind the last slash.
struct CTail {
    std::string mSign;
    std::string mBass;
};

CTail TailOf(const CChordLite& chord, const CWrittenDegree& degree, const CSignKeyLite& key,
             const CNumeralOptions& options) {
    const CChordSign sign = SignOfChord(chord.mSemitones, options);
    // subV is a dominant by its name.
    const bool isOfKey = options.mByKey && degree.mText != kSubstitute.mNumeral;
    std::string text(isOfKey && sign.mAlterations.empty() ? SignByKey(sign.mSign, degree.mRoot)
                                                          : sign.mSign);
    // Among figures a bare 6 is an inversion.
    if (text == "6" && (options.mFigures || options.mByKey)) text = "add6";
    std::string bass;
    const int intvl = chord.HasBassNote() ? IntvlBetween(chord.mRootKeyEnh, chord.mBassKeyEnh) : 0;
    std::string figured;
    const bool mayHaveFigure = sign.mAlterations.empty() && !IsSpelledOtherwise(chord, intvl);
    if (intvl != 0 && options.mFigures && mayHaveFigure) {
        figured = SignWithFigure(text, chord.mSemitones, intvl);
    }
    if (intvl != 0 && figured.empty()) {
        bass = "/^" + DegreeText(BassDegree(chord, degree.mNumber, key), false, true);
    }
    if (!figured.empty()) text = figured;
    if (options.mPrintedSigns) text = WithPrintedSigns(text);
    return {text + sign.mAlterations, bass};
}

// A degree that is written without an accidental and sounds so.
bool IsNatural(const CReadDegree& degree, const CKeyEnh& keyEnh, const CSignKeyLite& key) {
    const int semitones = SemitonesOfDegree(degree.mDegree, key.mSignKeyType);
    return degree.mDegree.mAccidental == 0 && DistToTonic(keyEnh, key) == semitones;
}

// The degree of a numeral in the key, or in that of the degree behind its slash.
CWrittenDegree DegreeOfNumeral(std::string_view numeral, const CChordLite& chord, CSignKeyLite key,
                               const CNumeralOptions& options) {
    const std::size_t slash = std::min(numeral.find('/'), numeral.size());
    const CReadDegree own = ReadDegree(numeral.substr(0, slash));
    const CReadDegree of = ReadDegree(numeral.substr(std::min(slash + 1, numeral.size())));
    CWrittenDegree written{std::string(numeral.substr(0, slash - own.mRest.size())),
                           {own.mDegree, key.mSignKeyType, own.mIsSmall},
                           own.mDegree.mNumber,
                           {}};
    if (of.IsRead()) {
        const CNumeralDegree target = FoldMinorFlat(of.mDegree, key.mSignKeyType);
        const CSemitones triad(of.mIsSmall ? 137 : 145);
        written.mTarget =
            "/" + DegreeText(HeldInMinor(of.mDegree, triad, key, options), of.mIsSmall, false);
        written.mNumber = (target.mNumber + own.mDegree.mNumber - 2) % 7 + 1;
        key = CSignKeyLite(NoteOfDegree(target, key),
                           of.mIsSmall ? TSignKeyType_Minor : TSignKeyType_Major);
        written.mRoot.mKeyType = key.mSignKeyType;
    }
    if (own.IsRead() && IsNatural(own, chord.mRootKeyEnh, key)) {
        const auto held = HeldInMinor(own.mDegree, chord.mSemitones, key, options);
        if (held.mAccidental != 0) written.mText = DegreeText(held, own.mIsSmall, false);
    }
    return written;
}

// Each tone of a diminished seventh chord can be its root: the chord on that of its numeral. A
// figure tells which tone lies below.
CChordLite OnRootOfNumeral(CChordLite chord, std::string_view numeral, const CSignKeyLite& key,
                           const CNumeralOptions& options) {
    constexpr std::uint64_t kDiminishedSeventh = 0b1001001001;
    if (chord.mSemitones.Mask() != kDiminishedSeventh) return chord;
    const CKeyEnh root = ReadNumeral(numeral, key).mChord.mRootKeyEnh;
    const int moved = IntvlBetween(chord.mRootKeyEnh, root);
    if (root.IsUndef() || moved == 0 || moved % 3 != 0) return chord;
    const CKeyEnh lowest = chord.HasBassNote() ? chord.mBassKeyEnh : chord.mRootKeyEnh;
    const bool tellsBass = chord.HasBassNote() || options.mFigures;
    chord.mRootKeyEnh = root;
    chord.mBassKeyEnh = CKeyEnh_Undef;
    if (tellsBass && IntvlBetween(root, lowest) != 0) {
        chord.mBassKeyEnh = {lowest.mKeyNr, TEnh_Undef};
    }
    return chord;
}

}  // namespace

std::string NumeralInStyle(std::string_view numeral, const CChordLite& chord,
                           const CSignKeyLite& key, const CNumeralOptions& options) {
    if (chord.IsUndef() || key.IsUndef()) return {};
    if (options.mNashville) return RomanNumeral(chord, key, nullptr, options);
    // It6 would be read as a I.
    const bool isName = AugmentedSixthOf(numeral) != nullptr || !ReadDegree(numeral).IsRead();
    if (isName) return std::string(numeral);
    const CChordLite rooted = OnRootOfNumeral(chord, numeral, key, options);
    const CWrittenDegree degree = DegreeOfNumeral(numeral, rooted, key, options);
    const CTail tail = TailOf(rooted, degree, key, options);
    return degree.mText + tail.mSign + degree.mTarget + tail.mBass;
}

std::string RomanNumeral(const CChordLite& chord, const CSignKeyLite& key, const CChordLite* next,
                         const CNumeralOptions& options) {
    if (chord.IsUndef() || key.IsUndef()) return {};
    const CWrittenDegree degree = DegreeBefore(next, chord, key, options);
    const CTail tail = TailOf(chord, degree, key, options);
    return degree.mText + tail.mSign + degree.mTarget + tail.mBass;
}

std::vector<std::string> NumeralsOf(const CHarmAnlsChords& chords, const CKeyOfSong& keys,
                                    const CNumeralOptions& options) {
    std::vector<std::string> numerals(chords.size());
    const std::vector<CKeyChord> heard = KeyChordsOf(chords);
    auto region = keys.mRegions.rbegin();
    const CChordLite* next = nullptr;
    std::size_t end = chords.size();
    for (std::size_t i = heard.size(); i-- > 0;) {
        const std::size_t begin = heard[i].mBegin;
        // A dominant that is written twice leads to what comes behind both.
        if (i + 1 < heard.size() && !IsSameKind(heard[i], heard[i + 1])) {
            next = &chords[heard[i + 1].mBegin];
        }
        while (region != keys.mRegions.rend() && region->mBegin > begin) ++region;
        if (region == keys.mRegions.rend()) break;
        const std::string numeral = RomanNumeral(chords[begin], region->mKey, next, options);
        for (std::size_t ix = begin; ix < end; ++ix) {
            // The same sounds may be spelled anew: F7/Eb F7/D#.
            const bool isSpelledAlike = chords[ix] == chords[begin];
            if (chords[ix].IsUndef()) continue;
            numerals[ix] =
                isSpelledAlike ? numeral : RomanNumeral(chords[ix], region->mKey, next, options);
        }
        end = begin;
    }
    return numerals;
}

}  // namespace brindle
