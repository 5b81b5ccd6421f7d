// SPDX-License-Identifier: MIT
#include "brindle/song/ReadSongHarmony.h"

namespace brindle {
namespace {

bool IsTrusted(const CSong& song, const CKeyOptions& options) {
    return song.mStatedKey &&
           (!IsScore(song.mFormat) || FindKeys(song.mChords, options).mKey == *song.mStatedKey);
}

}  // namespace

CSongReading ReadSongHarmony(const CSong& song, CReadingOptions options) {
    options.mKeys.mBeatsPerBar = song.mBeatsPerBar;
    if (options.mStatedKey.IsUndef() && IsTrusted(song, options.mKeys)) {
        options.mStatedKey = *song.mStatedKey;
    }
    if (options.mSevenths.empty()) options.mSevenths = song.mSevenths;
    return ReadHarmony(song.mChords, options);
}

}  // namespace brindle
