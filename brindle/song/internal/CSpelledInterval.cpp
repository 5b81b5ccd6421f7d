// SPDX-License-Identifier: MIT
#include "brindle/song/internal/CSpelledInterval.h"

#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/MakeSensefulEnh.h"

#include <cstdint>

namespace brindle {
namespace {

// On the line of fifths C is 0, G is 1 and F is -1, seven letters to each accidental.
constexpr int kFifthOfF = -1;
constexpr int kLetters = 7;
constexpr int kFifthsToEnharmonic = 12;

CKeyEnh KeyOfFifth(int fifth) {
    constexpr int kFirst = kFifthOfF - 2 * kLetters;     // Fbb
    constexpr int kLast = kFifthOfF + 3 * kLetters - 1;  // Bx
    while (fifth < kFirst) fifth += kFifthsToEnharmonic;
    while (fifth > kLast) fifth -= kFifthsToEnharmonic;
    return {FoldIntoOctave(std::int64_t{fifth} * 7),
            SemitoneToEnh((fifth - kFirst) / kLetters - 2)};
}

}  // namespace

int FifthOf(const CKeyEnh& key) {
    int fifth = kFifthOfF + kLetters * EnhToSemitone(key.mEnh);
    while (FoldIntoOctave(std::int64_t{fifth} * 7) != key.mKeyNr) ++fifth;
    return fifth;
}

void CSpelledInterval::Move(CKeyEnh& key) const {
    if (key.IsUndef()) return;
    if (IsSensefulEnhForKeyNr(key.mKeyNr, key.mEnh)) {
        key = KeyOfFifth(FifthOf(key) + mFifths);
    } else {
        key.mKeyNr = FoldIntoOctave(std::int64_t{key.mKeyNr} + mSemitones);
    }
}

void CSpelledInterval::Move(CChordLite& chord) const {
    Move(chord.mRootKeyEnh);
    Move(chord.mBassKeyEnh);
}

}  // namespace brindle
