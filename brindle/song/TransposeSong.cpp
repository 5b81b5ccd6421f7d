// SPDX-License-Identifier: MIT
#include "brindle/song/TransposeSong.h"

#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/song/ReadSongHarmony.h"
#include "brindle/song/internal/CSpelledInterval.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/MakeSensefulEnh.h"

namespace brindle {
namespace {

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
        interval.Move(chord);
        if (ix < result.mSymbols.size()) result.mSymbols[ix] = WriteChordSymbol(chord);
    }
    if (result.mStatedKey) interval.Move(result.mStatedKey->mRootKeyEnh);
    for (CHarmAnlsSignKey& key : result.mStatedKeys) interval.Move(key.mSignKey.mRootKeyEnh);
    return result;
}

}  // namespace brindle
