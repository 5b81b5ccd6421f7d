// SPDX-License-Identifier: MIT
#include "brindle/song/SongStyles.h"

#include <set>
#include <utility>

namespace brindle {

std::vector<std::string> StylesOf(const CSongModel& model) {
    std::set<std::string> styles;
    for (const CTaughtSong& song : model.Songs()) {
        if (!song.mStyle.empty()) styles.insert(song.mStyle);
    }
    return {styles.begin(), styles.end()};
}

std::optional<CSongModel> ModelOfStyle(const CSongModel& model, std::string_view style) {
    std::vector<CTaughtSong> songs;
    for (const CTaughtSong& song : model.Songs()) {
        if (song.mStyle == style) songs.push_back(song);
    }
    if (songs.empty()) return std::nullopt;
    return CSongModel(std::move(songs));
}

}  // namespace brindle
