// SPDX-License-Identifier: MIT
#include "brindle/present/ModelSongsText.h"

#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownText.h"
#include "brindle/present/TonalityName.h"
#include "brindle/song/BuiltInSongs.h"
#include "brindle/song/SongStyles.h"

#include <fmt/format.h>

#include <algorithm>
#include <nlohmann/json.hpp>
#include <vector>

namespace brindle {
namespace {

std::string MakersOf(const CTaughtSong& song) {
    return std::string(BuiltInMakersOf(song.mTitle, song.mStyle));
}

std::string StyleCounts(const CSongModel& model) {
    std::vector<std::string> counts;
    for (const std::string& style : StylesOf(model)) {
        const auto isOfStyle = [&](const CTaughtSong& song) {
            return IsSameStyle(song.mStyle, style);
        };
        const auto count = std::count_if(model.Songs().begin(), model.Songs().end(), isOfStyle);
        counts.push_back(fmt::format("{} {}", count, Printable(style)));
    }
    return counts.empty() ? std::string() : fmt::format(": {}", fmt::join(counts, ", "));
}

}  // namespace

std::string ModelSongsText(const CSongModel& model, const CPaint& paint) {
    CTable table({"title", "makers", "style", "key", " chords"});
    for (const CTaughtSong& song : model.Songs()) {
        table.AddRow({Printable(song.mTitle), MakersOf(song), Printable(song.mStyle),
                      TonalityName(song.mKey), fmt::format("{}", song.mChords.size())});
    }
    const std::size_t songs = model.Songs().size();
    return fmt::format("{} {}, {} chords{}\n\n{}", songs, songs == 1 ? "song" : "songs",
                       model.ChordCount(), StyleCounts(model), table.Text(paint));
}

std::string ModelSongsJson(const CSongModel& model) {
    Json songs = Json::array();
    for (const CTaughtSong& song : model.Songs()) {
        songs.push_back({{"Title", Printable(song.mTitle)},
                         {"Makers", MakersOf(song)},
                         {"Style", Printable(song.mStyle)},
                         {"Key", TonalityName(song.mKey)},
                         {"Chords", song.mChords.size()}});
    }
    return JsonText({{"Chords", model.ChordCount()}, {"Songs", songs}});
}

}  // namespace brindle
