// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/CChordTextParser.h"

#include "brindle/chords/internal/ChordKinds.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <array>

namespace brindle::ChordText {
namespace {

/// A degree of the major scale with flats and sharps, as in `bb7`.
struct CColonDegree {
    /// 1 to 13.
    int mDegree = 0;
    /// Signs, reduced to within an octave.
    int mAccidental = 0;

    [[nodiscard]] constexpr int Tone() const {
        const int natural = kNaturalKeyNrs[static_cast<std::size_t>((mDegree - 1) % 7)];
        return FoldIntoOctave(natural + mAccidental);
    }
};

/// Reads `b`s or `#`s and a number; degree 0 if there is none.
constexpr CColonDegree TakeDegree(CTextScan& scan) {
    CColonDegree degree;
    while (scan.Peek() == 'b' || scan.Peek() == '#') {
        degree.mAccidental = (degree.mAccidental + (scan.Peek() == 'b' ? -1 : 1)) % 12;
        ++scan.mPos;
    }
    for (int digits = 0; digits < 2 && IsDigit(scan.Peek()); ++digits) {
        degree.mDegree = degree.mDegree * 10 + (scan.Peek() - '0');
        ++scan.mPos;
    }
    if (degree.mDegree > 13) degree.mDegree = 0;
    return degree;
}

struct CColonRow {
    std::string_view mWord;
    CSemitones mTones;
};

// Here 7 is the major seventh, b7 the minor one.
// clang-format off
constexpr auto kColonRows = std::to_array<CColonRow>({
    {"maj",     TonesOfChordKind("")},
    {"min",     TonesOfChordKind("m")},
    {"dim",     TonesOfChordKind("dim")},
    {"aug",     TonesOfChordKind("aug")},
    {"sus2",    TonesOfChordKind("sus2")},
    {"sus4",    TonesOfChordKind("sus4")},
    {"sus",     TonesOfChordKind("sus4")},
    {"1",       CSemitones{0}},
    {"5",       TonesOfChordKind("5")},
    {"maj6",    TonesOfChordKind("6")},
    {"6",       TonesOfChordKind("6")},
    {"min6",    TonesOfChordKind("m6")},
    {"7",       TonesOfChordKind("7")},
    {"maj7",    TonesOfChordKind("maj7")},
    {"min7",    TonesOfChordKind("m7")},
    {"minmaj7", TonesOfChordKind("mmaj7")},
    {"dim7",    TonesOfChordKind("dim7")},
    {"hdim7",   TonesOfChordKind("m7b5")},
    {"hdim",    TonesOfChordKind("m7b5")},
    {"9",       TonesOfChordKind("9")},
    {"maj9",    TonesOfChordKind("maj9")},
    {"min9",    TonesOfChordKind("m9")},
    {"11",      TonesOfChordKind("11")},
    {"maj11",   TonesOfChordKind("maj11")},
    {"min11",   TonesOfChordKind("m11")},
    {"13",      TonesOfChordKind("13")},
    {"maj13",   TonesOfChordKind("maj13")},
    {"min13",   TonesOfChordKind("m13")},
});
// clang-format on

/// The tones of a word; a text without one has the root alone.
std::optional<CSemitones> TonesOfWord(std::string_view word, bool hasDegrees) {
    if (word.empty() && hasDegrees) word = "1";
    const auto* const row = std::find_if(kColonRows.begin(), kColonRows.end(),
                                         [&](const CColonRow& r) { return r.mWord == word; });
    if (row == kColonRows.end()) return std::nullopt;
    return row->mTones;
}

}  // namespace

bool CChordTextParser::ReadColonForm() {
    const std::size_t begin = mScan.mPos;
    const std::string_view rest = mScan.Rest();
    const std::string_view word = rest.substr(0, rest.find_first_of("(/"));
    mScan.mPos += word.size();
    auto tones = TonesOfWord(word, mScan.Peek() == '(');
    if (tones && ReadColonDegrees(*tones) && ReadColonBass()) {
        mSemitones = tones;
        return true;
    }
    mScan.mPos = begin;
    mBass.reset();
    return false;
}

bool CChordTextParser::ReadColonDegrees(CSemitones& tones) {
    if (!mScan.Take('(')) return true;
    do {
        mScan.SkipBlanks();
        const bool isLeftOut = mScan.Take('*');
        const CColonDegree degree = TakeDegree(mScan);
        if (degree.mDegree == 0) return false;
        tones.SetSemitone(degree.Tone(), !isLeftOut);
        mScan.SkipBlanks();
    } while (mScan.Take(','));
    return mScan.Take(')');
}

bool CChordTextParser::ReadColonBass() {
    if (mScan.AtEnd()) return true;
    if (!mScan.Take('/')) return false;
    mBass = WholeNote(mScan.mPos);
    if (mBass) return true;
    const std::size_t degreePos = mScan.mPos;
    const CColonDegree degree = TakeDegree(mScan);
    if (degree.mDegree == 0 || !mScan.AtEnd()) return false;
    // Spelled by its letter: the third of A flat is a C, and its flat third a C flat.
    const int letter = (mRoot.mLetter + degree.mDegree - 1) % 7;
    const int key = mRoot.KeyEnh().mKeyNr + degree.Tone();
    const int natural = kNaturalKeyNrs[static_cast<std::size_t>(letter)];
    const int accidental = FoldIntoOctave(key - natural + 6) - 6;
    if (accidental < -2 || accidental > 2) {
        Fail(TFault::OneAccidentalTooMany, degreePos);
        return true;
    }
    mBass = CWrittenNote{letter, accidental, false};
    return true;
}

}  // namespace brindle::ChordText
