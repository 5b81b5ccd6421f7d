// SPDX-License-Identifier: MIT
#include "brindle/song/TransposeSong.h"

#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/song/ReadSongHarmony.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/MakeSensefulEnh.h"

namespace brindle {
namespace {

// On the line of fifths C is 0, G is 1 and F is -1, seven letters to each accidental.
constexpr int kFifthOfF = -1;
constexpr int kLetters = 7;
constexpr int kFifthsToEnharmonic = 12;

/// The key is spelled, as its key number allows.
int FifthOf(const CKeyEnh& key) {
    int fifth = kFifthOfF + kLetters * EnhToSemitone(key.mEnh);
    while (FoldIntoOctave(std::int64_t{fifth} * 7) != key.mKeyNr) ++fifth;
    return fifth;
}

CKeyEnh KeyOfFifth(int fifth) {
    constexpr int kFirst = kFifthOfF - 2 * kLetters;     // Fbb
    constexpr int kLast = kFifthOfF + 3 * kLetters - 1;  // Bx
    while (fifth < kFirst) fifth += kFifthsToEnharmonic;
    while (fifth > kLast) fifth -= kFifthsToEnharmonic;
    return {FoldIntoOctave(std::int64_t{fifth} * 7),
            SemitoneToEnh((fifth - kFirst) / kLetters - 2)};
}

/// An interval by its semitones and its steps on the line of fifths.
struct CSpelledInterval {
    int mSemitones = 0;
    int mFifths = 0;

    void Move(CKeyEnh& key) const {
        if (key.IsUndef()) return;
        if (IsSensefulEnhForKeyNr(key.mKeyNr, key.mEnh)) {
            key = KeyOfFifth(FifthOf(key) + mFifths);
        } else {
            key.mKeyNr = FoldIntoOctave(std::int64_t{key.mKeyNr} + mSemitones);
        }
    }
};

/// The key above `from`; of F sharp and G flat the one that has the signs of `from`.
CSpelledInterval IntervalAbove(const CSignKeyLite& from, int semitones) {
    CSignKeyLite to = from;
    const int keyNr = FoldIntoOctave(std::int64_t{from.mRootKeyEnh.mKeyNr} + semitones);
    const bool isFlat = from.SignsCount() < 0;
    to.mRootKeyEnh = {keyNr, isFlat ? MakeSensefulEnhForKeyNrPreferFlats(keyNr, TEnh_Undef)
                                    : MakeSensefulEnhForKeyNrPreferSharps(keyNr, TEnh_Undef)};
    to.SetRootNoteEnhWithLeastSigns();
    return {semitones, FifthOf(to.mRootKeyEnh) - FifthOf(from.mRootKeyEnh)};
}

CSignKeyLite SpelledKeyOf(const CSong& song) {
    CSignKeyLite key = song.mStatedKey ? *song.mStatedKey : ReadSongHarmony(song).mKey;
    if (key.IsUndef()) key = {CKeyEnh_C, TSignKeyType_Major};
    key.mRootKeyEnh.mEnh =
        MakeSensefulEnhForKeyNrAssumingCMajor(key.mRootKeyEnh.mKeyNr, key.mRootKeyEnh.mEnh);
    return key;
}

}  // namespace

CSong TransposeSong(const CSong& song, int semitones) {
    CSong result = song;
    const int distance = FoldIntoOctave(semitones);
    if (distance == 0) return result;
    const CSpelledInterval interval = IntervalAbove(SpelledKeyOf(song), distance);
    for (std::size_t ix = 0; ix < result.mChords.size(); ++ix) {
        CHarmAnlsChordWithPos& chord = result.mChords[ix];
        if (chord.IsUndef()) continue;
        interval.Move(chord.mRootKeyEnh);
        interval.Move(chord.mBassKeyEnh);
        if (ix < result.mSymbols.size()) result.mSymbols[ix] = WriteChordSymbol(chord);
    }
    if (result.mStatedKey) interval.Move(result.mStatedKey->mRootKeyEnh);
    for (CHarmAnlsSignKey& key : result.mStatedKeys) interval.Move(key.mSignKey.mRootKeyEnh);
    return result;
}

}  // namespace brindle
