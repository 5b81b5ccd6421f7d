// SPDX-License-Identifier: MIT
#include "brindle/song/SplitSongs.h"

#include "brindle/song/internal/SongReaders.h"

#include <memory>
#include <utility>

namespace brindle {

std::vector<CUnreadSong> SplitSongs(std::string bytes, const CSongOptions& prefs) {
    if (SongReaders::HoldsCharts(bytes, prefs.mFormat)) {
        const TSongFormat format =
            prefs.mFormat == TSongFormat_Auto ? SongFormatOf(bytes) : prefs.mFormat;
        return SongReaders::SplitChartLinks(bytes, format, prefs);
    }
    const std::size_t count = bytes.size();
    // A function can be copied; the bytes are not.
    auto shared = std::make_shared<const std::string>(std::move(bytes));
    std::vector<CUnreadSong> songs;
    songs.push_back(
        {[shared = std::move(shared), prefs] { return ReadSong(*shared, prefs); }, count});
    return songs;
}

}  // namespace brindle
