// SPDX-License-Identifier: MIT
#include "brindle/song/SongStyles.h"

#include "brindle/platform/Ascii.h"

#include <algorithm>
#include <set>
#include <utility>

namespace brindle {

bool IsSameStyle(std::string_view a, std::string_view b) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end(), [](char one, char other) {
        return Ascii::ToLower(one) == Ascii::ToLower(other);
    });
}

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
        if (IsSameStyle(song.mStyle, style)) songs.push_back(song);
    }
    if (songs.empty()) return std::nullopt;
    return CSongModel(std::move(songs));
}

}  // namespace brindle
