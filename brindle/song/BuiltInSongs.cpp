// SPDX-License-Identifier: MIT
#include "brindle/song/BuiltInSongs.h"

#include "brindle/song/ReadSong.h"
#include "brindle/song/SongStyles.h"
#include "brindle/song/internal/BuiltInSongs_Table.h"
#include "brindle/theory/ReadKeyText.h"

namespace brindle {
namespace {

CSong BuiltInSong(const CBuiltInSongRow& row) {
    CSongOptions options;
    options.mBeatsPerBar = row.mBeatsPerBar;
    options.mEven = row.mBeatsPerChord == 0.0;
    if (!options.mEven) options.mBeatsPerChord = row.mBeatsPerChord;
    options.mFormat = options.mEven ? TSongFormat_EvenText : TSongFormat_ChordText;
    CSong song = ReadSong(row.mText, options);
    song.mTitle = row.mTitle;
    song.mMakers = row.mMakers;
    song.mStyle = row.mStyle;
    const CSignKeyLite key = ReadKeyText(row.mKey).mSignKey;
    if (*row.mKey != '\0' && !key.IsUndef()) song.mStatedKey = key;
    return song;
}

}  // namespace

std::vector<CSong> BuiltInSongs() {
    std::vector<CSong> songs;
    for (const CBuiltInSongRow& row : BuiltInSongRows()) songs.push_back(BuiltInSong(row));
    return songs;
}

std::string_view BuiltInMakersOf(std::string_view title, std::string_view style) {
    for (const CBuiltInSongRow& row : BuiltInSongRows()) {
        if (title == row.mTitle && style == row.mStyle) return row.mMakers;
    }
    return {};
}

CSongModel BuiltInSongModel(std::string_view style) {
    std::vector<CTaughtSong> songs;
    for (const CBuiltInSongRow& row : BuiltInSongRows()) {
        if (style.empty() || IsSameStyle(style, row.mStyle))
            songs.push_back(TeachSong(BuiltInSong(row)));
    }
    return CSongModel(std::move(songs));
}

}  // namespace brindle
