// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/CChordTextParser.h"

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
    std::string_view mDegrees;
};

// Here 7 is the major seventh, b7 the minor one.
constexpr auto kColonRows = std::to_array<CColonRow>({
    {"maj", "1 3 5"},
    {"min", "1 b3 5"},
    {"dim", "1 b3 b5"},
    {"aug", "1 3 #5"},
    {"sus2", "1 2 5"},
    {"sus4", "1 4 5"},
    {"sus", "1 4 5"},
    {"1", "1"},
    {"5", "1 5"},
    {"maj6", "1 3 5 6"},
    {"6", "1 3 5 6"},
    {"min6", "1 b3 5 6"},
    {"7", "1 3 5 b7"},
    {"maj7", "1 3 5 7"},
    {"min7", "1 b3 5 b7"},
    {"minmaj7", "1 b3 5 7"},
    {"dim7", "1 b3 b5 bb7"},
    {"hdim7", "1 b3 b5 b7"},
    {"hdim", "1 b3 b5 b7"},
    {"9", "1 3 5 b7 9"},
    {"maj9", "1 3 5 7 9"},
    {"min9", "1 b3 5 b7 9"},
    {"11", "1 3 5 b7 9 11"},
    {"maj11", "1 3 5 7 9 11"},
    {"min11", "1 b3 5 b7 9 11"},
    {"13", "1 3 5 b7 9 11 13"},
    {"maj13", "1 3 5 7 9 11 13"},
    {"min13", "1 b3 5 b7 9 11 13"},
});

constexpr CSemitones TonesOf(std::string_view degrees) {
    CSemitones tones;
    CTextScan scan(degrees, degrees);
    while (!scan.AtEnd()) {
        tones.SetSemitone(TakeDegree(scan).Tone(), true);
        scan.SkipBlanks();
    }
    return tones;
}
static_assert(TonesOf("1 b3 b5 bb7") == CSemitones{0, 3, 6, 9});

/// The tones of a word; a text without one has the root alone.
std::optional<CSemitones> TonesOfWord(std::string_view word, bool hasDegrees) {
    if (word.empty() && hasDegrees) word = "1";
    const auto* const row = std::find_if(kColonRows.begin(), kColonRows.end(),
                                         [&](const CColonRow& r) { return r.mWord == word; });
    if (row == kColonRows.end()) return std::nullopt;
    return TonesOf(row->mDegrees);
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
