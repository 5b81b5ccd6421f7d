// SPDX-License-Identifier: MIT
#include "brindle/song/ReadSongHarmony.h"

namespace brindle {
namespace {

bool IsScore(const CSong& song) {
    return song.mFormat == TSongFormat_MusicXml || song.mFormat == TSongFormat_CompressedMusicXml;
}

bool IsTrusted(const CSong& song, const CKeyOptions& options) {
    return song.mStatedKey &&
           (!IsScore(song) || FindKeys(song.mChords, options).mKey == *song.mStatedKey);
}

}  // namespace

CSongReading ReadSongHarmony(const CSong& song, CReadingOptions options) {
    options.mKeys.mBeatsPerBar = song.mBeatsPerBar;
    if (options.mStatedKey.IsUndef() && IsTrusted(song, options.mKeys)) {
        options.mStatedKey = *song.mStatedKey;
    }
    return ReadHarmony(song.mChords, options);
}

}  // namespace brindle
