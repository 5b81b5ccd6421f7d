// SPDX-License-Identifier: MIT
#include "brindle/song/SplitSongs.h"

#include "brindle/song/internal/SongReaders.h"

#include <memory>
#include <utility>

namespace brindle {

namespace {

TSongFormat FormatOf(std::string_view bytes, const CSongOptions& prefs) {
    return prefs.mFormat == TSongFormat_Auto ? SongFormatOf(bytes) : prefs.mFormat;
}

/// Of most texts this is asked without a look at their form.
bool HoldsChordProSongs(std::string_view bytes, const CSongOptions& prefs) {
    const bool mayHold = bytes.find("{n") != bytes.npos || bytes.find("{N") != bytes.npos;
    return mayHold && FormatOf(bytes, prefs) == TSongFormat_ChordPro;
}

}  // namespace

std::vector<CUnreadSong> SplitSongs(std::string bytes, const CSongOptions& prefs) {
    if (SongReaders::HoldsCharts(bytes, prefs.mFormat)) {
        return SongReaders::SplitChartLinks(bytes, FormatOf(bytes, prefs), prefs);
    }
    const std::size_t count = bytes.size();
    // A function can be copied; the bytes are not.
    auto shared = std::make_shared<const std::string>(std::move(bytes));
    std::vector<CUnreadSong> songs;
    if (HoldsChordProSongs(*shared, prefs)) {
        for (const SongReaders::CPartOfText& part : SongReaders::SongsOfChordPro(*shared)) {
            songs.push_back(
                {[shared, part, prefs] { return SongReaders::ReadChordProSong(part, prefs); },
                 part.mText.size()});
        }
        return songs;
    }
    songs.push_back({[shared, prefs] { return ReadSong(*shared, prefs); }, count});
    return songs;
}

}  // namespace brindle
