// SPDX-License-Identifier: MIT
#include "brindle/song/CRelativeChord.h"

#include "brindle/analysis/internal/KeyNumbers.h"
#include "brindle/analysis/internal/NumeralDegree.h"
#include "brindle/analysis/internal/NumeralText.h"
#include "brindle/chords/ChordTones.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {
namespace {

constexpr std::uint64_t kDiminished = 0b1001001;
constexpr std::uint64_t kThirdAndFifth = 0b11111000;

constexpr int kRaisedDegrees[] = {1, 3, 6, 8, 10};

// A diminished chord between two degrees leads upwards: it stands on the lower one, raised.
bool IsRaised(const CRelativeChord& chord) {
    if ((chord.mMask & (kThirdAndFifth | 1)) != kDiminished) return false;
    for (const int degree : kRaisedDegrees) {
        if (chord.mRoot == degree) return true;
    }
    return false;
}

CKeyEnh RootInKey(const CRelativeChord& chord, const CSignKeyLite& key) {
    const int number = NumberOfKey(key);
    if (!IsRaised(chord)) return NoteOfDegree(NumeralDegreeOf(chord.mRoot, number), key);
    const CKeyEnh below = NoteOfDegree(NumeralDegreeOf(chord.mRoot - 1, number), key);
    return SpelledAbove(below, 0, 1);
}

}  // namespace

std::uint32_t CRelativeChord::Code() const {
    return std::uint32_t{mMask} | std::uint32_t{mBass} << 12U | std::uint32_t{mRoot} << 16U |
           std::uint32_t{mShift} << 20U | (mIsMinorKey ? 1U << 24U : 0U);
}

std::optional<CRelativeChord> CRelativeChord::FromCode(std::uint32_t code) {
    CRelativeChord chord;
    chord.mMask = static_cast<std::uint16_t>(code & 0xFFFU);
    chord.mBass = static_cast<std::uint8_t>(code >> 12U & 15U);
    chord.mRoot = static_cast<std::uint8_t>(code >> 16U & 15U);
    chord.mShift = static_cast<std::uint8_t>(code >> 20U & 15U);
    chord.mIsMinorKey = (code >> 24U & 1U) != 0;
    const bool isOne = code >> 25U == 0 && chord.mBass < 12 && chord.mRoot < 12 &&
                       chord.mShift < 12 && chord.mMask != 0;
    return isOne ? std::optional(chord) : std::nullopt;
}

CRelativeChord RelativeChordOf(const CChordLite& chord, const CSignKeyLite& key, int tonicBefore) {
    const int root = chord.mRootKeyEnh.mKeyNr;
    CRelativeChord relative;
    relative.mShift =
        static_cast<std::uint8_t>(FoldIntoOctave(key.mRootKeyEnh.mKeyNr - tonicBefore));
    relative.mIsMinorKey = key.mSignKeyType == TSignKeyType_Minor;
    relative.mRoot = static_cast<std::uint8_t>(FoldIntoOctave(root - key.mRootKeyEnh.mKeyNr));
    if (chord.HasBassNote()) {
        relative.mBass = static_cast<std::uint8_t>(FoldIntoOctave(chord.mBassKeyEnh.mKeyNr - root));
    }
    relative.mMask = static_cast<std::uint16_t>(chord.mSemitones.Mask() & 0xFFFU);
    return relative;
}

CChordLite ChordInKey(const CRelativeChord& chord, const CSignKeyLite& key) {
    CChordLite written;
    written.mRootKeyEnh = RootInKey(chord, key);
    written.mSemitones = CSemitones(std::uint64_t{chord.mMask});
    if (chord.mBass != 0) written.mBassKeyEnh = ToneAboveRoot(written, chord.mBass);
    return written;
}

CSignKeyLite KeyAbove(const CSignKeyLite& home, int semitones, bool isMinor) {
    const int degree = FoldIntoOctave(semitones);
    CSignKeyLite key(NoteOfDegree(NumeralDegreeOf(degree, NumberOfKey(home)), home),
                     isMinor ? TSignKeyType_Minor : TSignKeyType_Major);
    if (degree != 0 && key.SignsCountAbs() > 6) key.SetRootNoteEnhWithLeastSigns();
    return key;
}

}  // namespace brindle
