// SPDX-License-Identifier: MIT
#include "brindle/present/ModelSongsText.h"

#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownText.h"
#include "brindle/present/TonalityName.h"
#include "brindle/song/BuiltInSongs.h"

#include <fmt/format.h>

#include <cstddef>
#include <map>
#include <nlohmann/json.hpp>
#include <vector>

namespace brindle {
namespace {

std::string MakersOf(const CTaughtSong& song) {
    return std::string(BuiltInMakersOf(song.mTitle, song.mStyle));
}

std::string StyleCounts(const CSongModel& model) {
    std::map<std::string, std::size_t> counts;
    for (const CTaughtSong& song : model.Songs()) {
        if (!song.mStyle.empty()) ++counts[song.mStyle];
    }
    std::vector<std::string> told;
    for (const auto& [style, count] : counts) {
        told.push_back(fmt::format("{} {}", count, Printable(style)));
    }
    return told.empty() ? std::string() : fmt::format(": {}", fmt::join(told, ", "));
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
