// SPDX-License-Identifier: MIT
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/KeyIntervals.h"

#include <cstdlib>

namespace brindle {

namespace {

/// The sum, which wraps round for numbers that are far beyond any note.
std::int64_t Moved(std::int64_t noteNr, std::int64_t semitones) {
    return static_cast<std::int64_t>(static_cast<std::uint64_t>(noteNr) +
                                     static_cast<std::uint64_t>(semitones));
}

/// The same key in the nearest octave within 0 to 127.
std::int64_t FoldIntoKeyboard(std::int64_t noteNr) {
    if (noteNr < 0) return FoldIntoOctave(noteNr);
    return noteNr > 127 ? 127 - FoldIntoOctave(127 - noteNr) : noteNr;
}

/// Walks semitone by semitone over the keys of a scale. At least one key must be in it.
class CScaleWalk {
public:
    CScaleWalk(CSemitones keys, int startKeyNr) : mKeys(keys), mStartKeyNr(startKeyNr) {}

    /// Semitones from the start, negative for down.
    [[nodiscard]] std::int64_t Walked() const { return mWalked; }

    /// Goes on to a key of the scale, unless it stands on one.
    void GoIntoScale(int direction) {
        while (!IsInScale()) mWalked += direction;
    }
    void GoDegrees(int count, int direction) {
        for (int n = 0; n < count; ++n) {
            mWalked += direction;
            GoIntoScale(direction);
        }
    }

private:
    [[nodiscard]] bool IsInScale() const {
        return mKeys.HasIntvl(FoldIntoOctave(mStartKeyNr + mWalked));
    }

    CSemitones mKeys;
    int mStartKeyNr;
    std::int64_t mWalked = 0;
};

/// A key beside the one that is quantized.
struct CNeighbour {
    int mKeyNr;
    int mDegree = -1;
    int mOctave = 0;
};

/// The nearer one; `isAboveAtTie` decides between equals.
const CNeighbour& Nearer(const CNeighbour& below, const CNeighbour& above, int keyNr,
                         bool isAboveAtTie) {
    if (below.mDegree < 0) return above;
    if (above.mDegree < 0) return below;
    const int distanceBelow = keyNr - below.mKeyNr;
    const int distanceAbove = above.mKeyNr - keyNr;
    if (distanceBelow == distanceAbove) return isAboveAtTie ? above : below;
    return distanceBelow < distanceAbove ? below : above;
}

}  // namespace

std::int64_t CScaleHeavy::MoveInScale(std::int64_t noteNr, int steps, bool fold) const {
    if (IsUndef() || mScaleType == st_Undef) return noteNr;
    if (IsNoteNrUndef(noteNr)) return kNoteNrUndef;
    const int degrees = DegreesPerOctave();
    if (degrees <= 0) return noteNr;

    CSemitones keys = ToSemitones();
    keys.RotateRootToIx(-RootKeyNr());
    CScaleWalk walk(keys, FoldIntoOctave(noteNr));
    if (steps != 0) walk.GoIntoScale(steps > 0 ? -1 : 1);
    walk.GoDegrees(std::abs(steps % degrees), steps > 0 ? 1 : -1);

    const std::int64_t octaves = steps / degrees;
    const std::int64_t moved = Moved(noteNr, octaves * 12 + walk.Walked());
    return fold ? FoldIntoKeyboard(moved) : moved;
}

CNote CScaleHeavy::MoveInScale(const CNote& note, int steps) const {
    if (IsUndef() || mScaleType == st_Undef || DegreesPerOctave() <= 0) return note;
    CNote moved(MoveInScale(note.mNoteNr, steps, true), TEnh_Undef);
    if (moved.IsUndef()) return moved;
    // As the scale has it, also where that is no usual spelling: F triple sharp in G double sharp.
    moved.SetEnhAndDontMakeSenseful(EnhForKeyNr(moved.KeyNr()));
    return moved;
}

int CScaleHeavy::QuantizeToScaleDegreeNr(int keyNr, TQuantizeToScaleDirection direction,
                                         int& octave) const {
    octave = 0;
    if (IsUndef() || keyNr == kKeyNrUndef) return -1;
    CNeighbour below{-1000};
    CNeighbour above{1000};
    for (int degree = 0; degree < ScaleRow().StoredDegreeCount(); ++degree) {
        const int degreeKeyNr = DegreeNrToKeyNr(degree);
        if (degreeKeyNr == keyNr) return degree;
        for (const int shift : {-1, 0, 1}) {
            const int candidate = degreeKeyNr + 12 * shift;
            if (candidate < keyNr && candidate > below.mKeyNr) below = {candidate, degree, shift};
            if (candidate > keyNr && candidate < above.mKeyNr) above = {candidate, degree, shift};
        }
    }
    const bool isAboveAtTie = direction == TQuantizeToScaleDirection_ClosestTieRight;
    const CNeighbour& nearer = Nearer(below, above, keyNr, isAboveAtTie);
    octave = nearer.mOctave;
    return nearer.mDegree;
}

CKeyEnh CScaleHeavy::QuantizeToScaleKeyEnh(const CKeyEnh& keyEnh,
                                           TQuantizeToScaleDirection direction) const {
    int octave = 0;
    const int degree = QuantizeToScaleDegreeNr(keyEnh.mKeyNr, direction, octave);
    return degree < 0 ? CKeyEnh_Undef : DegreeNrToKeyEnh(degree);
}

CNote CScaleHeavy::NoteQuantizeToScaleNote(const CNote& note,
                                           TQuantizeToScaleDirection direction) const {
    int octave = 0;
    const int keyNr = note.KeyNr();
    const int degree = QuantizeToScaleDegreeNr(keyNr, direction, octave);
    if (degree < 0) return CNote_Undef;
    const CKeyEnh key = DegreeNrToKeyEnh(degree);
    return {Moved(note.mNoteNr, key.mKeyNr + 12 * octave - keyNr), key.mEnh};
}

}  // namespace brindle
