// SPDX-License-Identifier: MIT
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/analysis/internal/AugmentedSixths.h"
#include "brindle/analysis/internal/CFoldedNumeral.h"
#include "brindle/analysis/internal/NumeralDegree.h"
#include "brindle/analysis/internal/NumeralPieces.h"
#include "brindle/analysis/internal/NumeralTables.h"
#include "brindle/analysis/internal/NumeralTones.h"
#include "brindle/platform/Ascii.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>

// A numeral is read in pieces, as the slashes cut it: the chord, what it is applied to (one degree
// or several, the last of them in the key of the song), and a bass. The chord is a head, a degree
// or a word such as Ger, and a tail with its signs and figures.

namespace brindle {
namespace {

constexpr std::string_view kNoDegree = "this is no degree";
constexpr std::string_view kNoSign = "this sign behind the degree is not understood";
constexpr std::string_view kNoGroup = "what stands in brackets is not understood";
constexpr std::string_view kNoTones = "nothing is left of the chord";
constexpr std::string_view kTooLong = "this is too long for a numeral";
constexpr std::string_view kNoKey = "there is no key";

const CAugmentedSixth* TakeAugmentedSixth(std::string_view& text) {
    const CAugmentedSixth* const chord = AugmentedSixthOf(text);
    if (chord != nullptr) text.remove_prefix(chord->mWord.size());
    return chord;
}

bool IsSubstitute(std::string_view text) {
    return text.starts_with("sub");
}

/// A chord before its root and bass are spelled.
struct CChordOfNumeral {
    CNumeralDegree mDegree;
    CSemitones mSemitones;
    int mBass = 0;      ///< semitones above the root
    int mBassStep = 1;  ///< the letters to it, 1 for the root
    std::string_view mFault;
    std::string_view mFaultPiece;
};

CChordOfNumeral Failed(std::string_view fault, std::string_view piece) {
    CChordOfNumeral chord;
    chord.mFault = fault;
    chord.mFaultPiece = piece;
    return chord;
}

bool ApplyGroups(const CFoldedNumeral& text, const CNumeralRoot& root, CReadTones& tones,
                 CChordOfNumeral& chord) {
    for (std::size_t i = 0; i < text.GroupCount(); ++i) {
        std::string_view group = text.Group(i);
        if (ApplyGroup(group, root, tones)) continue;
        chord = Failed(kNoGroup, group);
        return false;
    }
    return true;
}

// Where the bass is left out, V6[no3][add4], the tone beside it that was added is the bass.
int BassNearStep(CSemitones semitones, int step) {
    for (const int near : {step, step + 1, step - 1}) {
        const int bass = SemitoneOfStep(semitones, near);
        if (bass >= 0) return bass;
    }
    return 0;
}

// The figure of such a chord, Ger6/5 or Ger+6; null for one that it does not have.
const CAugmentedSixthFigure* FigureOfAugmentedSixth(std::string_view tail) {
    if (tail.starts_with('+')) tail.remove_prefix(1);
    const auto row =
        std::find_if(kAugmentedSixthFigures.begin(), kAugmentedSixthFigures.end(),
                     [&](const CAugmentedSixthFigure& known) { return known.mText == tail; });
    return row == kAugmentedSixthFigures.end() ? nullptr : &*row;
}

// The letter of a tone above the flat sixth (third, fifth, sixth) or, in the French chord, above
// the second degree.
int StepInAugmentedSixth(int semitone, bool isFrench) {
    if (semitone == 0) return 1;
    if (semitone == 4) return 3;
    if (semitone == 10) return isFrench ? 7 : 6;
    return 5;
}

CChordOfNumeral ReadAugmentedSixth(const CAugmentedSixth& sixth, std::string_view tail,
                                   const CFoldedNumeral& text, TSignKeyType type) {
    const CAugmentedSixthFigure* figure = FigureOfAugmentedSixth(tail);
    if (figure == nullptr) return Failed(kNoSign, tail);
    CChordOfNumeral chord;
    chord.mDegree = FoldMinorFlat(sixth.mRoot, type);
    const bool isFrench = sixth.mRoot.mNumber == 2;
    chord.mBass = isFrench ? figure->mBassInFrench : figure->mBassInMost;
    chord.mBassStep = StepInAugmentedSixth(chord.mBass, isFrench);
    const int turn = sixth.mStepRoot;
    CReadTones tones{sixth.mSemitones, 1};
    tones.mSemitones.RotateRootToIx(turn);
    const CNumeralDegree stepDegree = turn == 0 ? sixth.mRoot : CNumeralDegree{4, 1};
    if (!ApplyGroups(text, {stepDegree, TSignKeyType_Minor, false}, tones, chord)) return chord;
    tones.mSemitones.RotateRootToIx(12 - turn);
    chord.mSemitones = tones.mSemitones;
    return chord;
}

// In minor the leading tone is the root of viio7 and viiø7, whether or not it has its sharp. A viø7
// is on the raised sixth for those who write figures.
int RaisedInMinor(const CReadDegree& degree, bool isDiminished, const CNumeralOptions& options) {
    if (!degree.mIsSmall || degree.mDegree.mAccidental != 0) return 0;
    if (degree.mDegree.mNumber == 7) return isDiminished || options.mByKey ? 1 : 0;
    if (degree.mDegree.mNumber != 6) return 0;
    return options.mByKey || (isDiminished && options.mFigures) ? 1 : 0;
}

CNumeralDegree DegreeReadInKey(const CReadDegree& read, std::string_view tail, TSignKeyType type,
                               const CNumeralOptions& options) {
    CNumeralDegree degree = FoldMinorFlat(read.mDegree, type);
    if (type != TSignKeyType_Minor) return degree;
    const bool isDiminished = tail.starts_with('o') || tail.starts_with('h');
    degree.mAccidental += RaisedInMinor(read, isDiminished, options);
    return degree;
}

// vii/o7: the sign and the figures behind it.
std::string_view HalfDiminishedTail(std::string_view slashed) {
    constexpr auto tails = std::to_array<std::string_view>({"h", "h7", "h65", "h43", "h42", "h2"});
    const auto row = std::find_if(tails.begin(), tails.end(), [&](std::string_view tail) {
        return tail.substr(1) == slashed.substr(1);
    });
    return row == tails.end() ? std::string_view{} : *row;
}

/// The head of a chord, read: its degree, and the tail behind it.
struct CHead {
    CReadDegree mDegree;
    std::string_view mTail;
    /// The word of the head goes with figures: N6 is an inversion.
    bool mHasFigures = false;
};

CHead ReadHead(std::string_view text, TSignKeyType type) {
    for (const std::string_view word : {"Cad", "K"}) {
        if (!text.starts_with(word)) continue;
        const std::string_view tail = text.substr(word.size());
        return {{{1, 0}, type == TSignKeyType_Minor, false, tail},
                tail.empty() ? std::string_view("64") : tail,
                true};
    }
    // A common-tone diminished chord has the tonic in it.
    if (text.starts_with("CTo"))
        return {{{1, 0}, true, false, text.substr(2)}, text.substr(2), true};
    if (IsWordOfNeapolitan(text)) return {{{2, -1}, false, false, {}}, text.substr(1), true};
    CHead head{ReadDegree(text), {}, false};
    head.mTail = head.mDegree.mRest;
    return head;
}

CChordOfNumeral ReadChord(const CNumeralPieces& pieces, const CFoldedNumeral& text,
                          TSignKeyType type, CNumeralOptions options) {
    std::string_view tail = pieces.mChord;
    if (const CAugmentedSixth* sixth = TakeAugmentedSixth(tail)) {
        return ReadAugmentedSixth(*sixth, tail, text, type);
    }
    CHead head = ReadHead(pieces.mChord, type);
    if (!head.mDegree.IsRead()) return Failed(kNoDegree, pieces.mChord);
    options.mFigures = options.mFigures || head.mHasFigures;
    if (IsSubstitute(pieces.mChord)) {
        // A dominant by its name; in its own key its seventh would be major.
        options.mFigures = options.mFigures || options.mByKey;
        options.mByKey = false;
    }
    if (!pieces.mSlashedTail.empty()) {
        const std::string_view tailOfSign = HalfDiminishedTail(pieces.mSlashedTail);
        if (!head.mTail.empty() || tailOfSign.empty()) return Failed(kNoSign, pieces.mSlashedTail);
        head.mTail = tailOfSign;
    }
    CChordOfNumeral chord;
    chord.mDegree = DegreeReadInKey(head.mDegree, head.mTail, type, options);
    const CNumeralRoot root{chord.mDegree, type, head.mDegree.mIsSmall};
    CReadTones tones = TonesOfTail(head.mTail, root, options);
    if (tones.mSemitones.IsEmpty()) return Failed(kNoSign, head.mTail);
    if (!ApplyGroups(text, root, tones, chord)) return chord;
    chord.mSemitones = tones.mSemitones;
    if (tones.mBassStep != 1) {
        chord.mBass = BassNearStep(tones.mSemitones, tones.mBassStep);
        chord.mBassStep = StepOfSemitone(tones.mSemitones, chord.mBass);
    }
    return chord;
}

// "3", "b7" or "Eb".
CKeyEnh ReadBass(const CNumeralPieces& pieces, const CSignKeyLite& key) {
    const CReadDegree degree = ReadDegree(pieces.mBass);
    if (degree.IsRead()) {
        if (!degree.mIsDigit || !degree.mRest.empty()) return CKeyEnh_Undef;
        return NoteOfDegree(
            pieces.mIsExactBass ? degree.mDegree : FoldMinorFlat(degree.mDegree, key.mSignKeyType),
            key);
    }
    const char letter = pieces.mBass.front();
    if (pieces.mIsExactBass || letter < 'A' || letter > 'G') return CKeyEnh_Undef;
    CKeyEnh bass;
    int consumed = 0;
    bass.SetFromString(pieces.mBass, &consumed, ChordNamePrefsNonUTF8);
    return static_cast<std::size_t>(consumed) == pieces.mBass.size() ? bass : CKeyEnh_Undef;
}

// The key in which the numeral before the slash counts: that of the degree, minor for small
// letters. The figures of a target do not count.
std::optional<CSignKeyLite> KeyOfTarget(std::string_view target, const CSignKeyLite& key,
                                        const CNumeralOptions& options) {
    const CHead head = ReadHead(target, key.mSignKeyType);
    const CNumeralDegree degree =
        DegreeReadInKey(head.mDegree, head.mTail, key.mSignKeyType, options);
    const CNumeralRoot root{degree, key.mSignKeyType, head.mDegree.mIsSmall};
    if (TonesOfTail(head.mTail, root, options).mSemitones.IsEmpty()) return std::nullopt;
    const bool isMinor = head.mDegree.mIsSmall || head.mTail.starts_with('m');
    return CSignKeyLite(NoteOfDegree(degree, key),
                        isMinor ? TSignKeyType_Minor : TSignKeyType_Major);
}

CNumeralReading Fault(std::string_view fault, std::string_view piece, const CFoldedNumeral& text) {
    return {CChordLite_Undef, fault, text.OffsetOf(piece)};
}

CNumeralReading Finished(const CChordOfNumeral& chord, const CSignKeyLite& keyOfTarget,
                         const CNumeralPieces& pieces, const CSignKeyLite& key,
                         const CFoldedNumeral& text) {
    const CKeyEnh root = NoteOfDegree(chord.mDegree, keyOfTarget);
    CKeyEnh bass = CKeyEnh_Undef;
    if (chord.mBass != 0) bass = SpelledAbove(root, chord.mBassStep - 1, chord.mBass);
    if (!pieces.mBass.empty()) {
        bass = ReadBass(pieces, key);
        if (bass.IsUndef()) return Fault(kNoNumeralTarget, pieces.mBass, text);
    }
    return {CChordLite(root, bass, chord.mSemitones), {}, 0};
}

}  // namespace

CNumeralReading ReadNumeral(std::string_view typed, const CSignKeyLite& key,
                            const CNumeralOptions& options) {
    if (key.IsUndef()) return {CChordLite_Undef, kNoKey, 0};
    if (typed.find_first_of(Ascii::kWhiteSpace) != typed.npos)
        return {CChordLite_Undef, kNoDegree, 0};
    if (typed.size() > CFoldedNumeral::kLongest) return {CChordLite_Undef, kTooLong, 0};
    const CFoldedNumeral text(typed);
    if (!text.IsWhole()) return {CChordLite_Undef, kNoGroup, text.OffsetOfWrongBracket()};
    const CNumeralPieces pieces = NumeralPiecesOf(text.Text());
    if (!pieces.mFault.empty()) return Fault(pieces.mFault, pieces.mFaultPiece, text);
    CSignKeyLite keyOfTarget = key;
    for (std::size_t i = pieces.mTargetCount; i-- > 0;) {
        const auto target = KeyOfTarget(pieces.mTargets[i], keyOfTarget, options);
        if (!target) return Fault(kNoSign, pieces.mTargets[i], text);
        keyOfTarget = *target;
    }
    const CChordOfNumeral chord = ReadChord(pieces, text, keyOfTarget.mSignKeyType, options);
    if (!chord.mFault.empty()) return Fault(chord.mFault, chord.mFaultPiece, text);
    if (chord.mSemitones.IsEmpty()) return {CChordLite_Undef, kNoTones, 0};
    return Finished(chord, keyOfTarget, pieces, key, text);
}

std::optional<CChordLite> ChordFromNumeral(std::string_view text, const CSignKeyLite& key,
                                           const CNumeralOptions& options) {
    const CNumeralReading reading = ReadNumeral(text, key, options);
    if (reading.mChord.IsUndef()) return std::nullopt;
    return reading.mChord;
}

}  // namespace brindle
