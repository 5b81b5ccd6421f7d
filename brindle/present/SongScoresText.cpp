// SPDX-License-Identifier: MIT
#include "brindle/present/SongScoresText.h"

#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

namespace brindle {

std::string SongScoresText(std::span<const COrderScores> scores, std::size_t songs,
                           const CPaint& paint) {
    CTable table({" order", " bits per chord", " without keys", " saved"});
    for (const COrderScores& row : scores) {
        const double relative = row.mWithKeys.BitsPerChord();
        const double absolute = row.mWithoutKeys.BitsPerChord();
        table.AddRow({fmt::format("{}", row.mOrder), fmt::format("{:.3f}", relative),
                      fmt::format("{:.3f}", absolute),
                      fmt::format("{:.1f} %", 100.0 * (1.0 - relative / absolute))});
    }
    return fmt::format("{} {}, {} chords, histories interpolated\n\n{}", songs,
                       songs == 1 ? "song" : "songs", scores.front().mWithKeys.mChords,
                       table.Text(paint));
}

std::string SongScoresJson(std::span<const COrderScores> scores, std::size_t songs) {
    Json orders = Json::array();
    for (const COrderScores& row : scores) {
        orders.push_back(
            {{"Order", row.mOrder},
             {"BitsPerChord", NumberToJson(row.mWithKeys.BitsPerChord())},
             {"BitsPerChordWithoutKeys", NumberToJson(row.mWithoutKeys.BitsPerChord())}});
    }
    return JsonText({{"Songs", songs},
                     {"Chords", scores.front().mWithKeys.mChords},
                     {"Smoothing", "interpolation"},
                     {"Orders", orders}});
}

}  // namespace brindle
