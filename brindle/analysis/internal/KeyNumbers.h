// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/KeyChords.h"
#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {

// A key is a tonality as a number here: the pitch class of its tonic for major, and 12 more for
// minor. Pitch classes are called root, bass or tonic.
inline constexpr int kKeyCount = 24;

[[nodiscard]] constexpr int ModeOfKey(int key) {
    return key / 12;
}
[[nodiscard]] constexpr int TonicOfKey(int key) {
    return key % 12;
}
[[nodiscard]] constexpr bool IsMinorKey(int key) {
    return key >= 12;
}

/// The number of a sign key, -1 for an undefined one.
[[nodiscard]] constexpr int NumberOfKey(const CSignKeyLite& key) {
    if (key.IsUndef()) return -1;
    return FoldIntoOctave(key.mRootKeyEnh.mKeyNr) +
           (key.mSignKeyType == TSignKeyType_Minor ? 12 : 0);
}

/// How far a root, 0 to 11, lies above the tonic of a key, 0 to 11.
[[nodiscard]] constexpr int DegreeInKey(int root, int key) {
    const int dist = root - TonicOfKey(key);
    return dist < 0 ? dist + 12 : dist;
}

/// The scale that the chords of a key are made of; minor with the lowered and the raised seventh.
[[nodiscard]] constexpr CSemitones ScaleOfKey(int key) {
    return IsMinorKey(key) ? CSemitones{0, 2, 3, 5, 7, 8, 10, 11}
                           : CSemitones{0, 2, 4, 5, 7, 9, 11};
}
/// The scale that a key borrows from: the one with the same tonic in the other mode.
[[nodiscard]] constexpr CSemitones ParallelScaleOfKey(int key) {
    return IsMinorKey(key) ? CSemitones{0, 2, 4, 5, 7, 9, 11} : CSemitones{0, 2, 3, 5, 7, 8, 10};
}

/// Whether the chord on this degree of a scale is a minor one: ii, iii and vi; i, ii and iv.
[[nodiscard]] constexpr bool IsSmallDegree(int degree, int key) {
    return (IsMinorKey(key) ? CSemitones{0, 2, 5} : CSemitones{2, 4, 9}).HasIntvl(degree);
}

/// Whether the tones that make the chord what it is lie in a scale, the chord standing on `degree`.
[[nodiscard]] bool IsInScale(const CKeyChord& chord, int degree, CSemitones scale);

}  // namespace brindle
