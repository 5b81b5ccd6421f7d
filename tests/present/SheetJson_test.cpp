// SPDX-License-Identifier: MIT
#include "brindle/present/SheetJson.h"

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/song/ReadSong.h"

#include <doctest/doctest.h>
#include <nlohmann/json.hpp>

#include <string>
#include <string_view>
#include <vector>

namespace brindle::test {
namespace {

nlohmann::json SheetOf(std::string_view text) {
    const CSong song = ReadSong(text);
    return nlohmann::json::parse(SheetJson(song, ReadHarmony(song.mChords)));
}

std::vector<int> PlayedBars(const nlohmann::json& sheet) {
    std::vector<int> bars;
    for (const auto& bar : sheet["PlayedBars"]) bars.push_back(bar["Bar"]);
    return bars;
}

}  // namespace

TEST_CASE("A sheet as JSON has bars, chords in pieces, arrows and keys with their colors") {
    const nlohmann::json sheet = SheetOf("Dm7 | G7 | Cmaj7 . Bb7 . | A7");
    CHECK(sheet["Key"] == "C major");
    REQUIRE(sheet["Bars"].size() == 4);
    CHECK(sheet["Bars"][2]["Begin"] == 2);
    CHECK(sheet["Bars"][2]["End"] == 4);
    const auto& flat = sheet["Chords"][3];
    CHECK(flat["Symbol"] == "B\xE2\x99\xAD\x37");
    CHECK(flat["Position"] == 10.0);
    REQUIRE(flat["Runs"].size() == 3);
    CHECK(flat["Runs"][0] == nlohmann::json::array({"B", 1.0, 0.0}));
    CHECK(sheet["Chords"][1]["Numeral"] == "V7");
    CHECK(sheet["Brackets"][0] == nlohmann::json{{"From", 0}, {"To", 1}, {"IsDotted", false}});
    CHECK(sheet["Arrows"][0] == nlohmann::json{{"From", 1}, {"To", 2}, {"IsDotted", false}});
    CHECK(sheet["Keys"][sheet["Chords"][0]["Key"].get<std::size_t>()]["Name"] == "C major");
    CHECK(sheet["Keys"][0]["Paper"].get<std::string>().size() == 7);
}

TEST_CASE("A symbol by itself is set as on a sheet, and a numeral as that") {
    const nlohmann::json sheet = SheetOf("Cmaj7 | Bb7 | A7 | Dm7 | G7#9 | Am7/G | Bm7b5 | Db7/Cb");
    const CSong song = ReadSong("Cmaj7 | Bb7 | A7 | Dm7 | G7#9 | Am7/G | Bm7b5 | Db7/Cb");
    const CSongReading reading = ReadHarmony(song.mChords);
    for (std::size_t i = 0; i < reading.mChords.size() && i < sheet["Chords"].size(); ++i) {
        const auto& chord = sheet["Chords"][i];
        CHECK(nlohmann::json::parse(TextRunsJson(song.mSymbols[i], false)) == chord["Runs"]);
        CHECK(nlohmann::json::parse(TextRunsJson(reading.mChords[i].mNumeral, true)) ==
              chord["NumeralRuns"]);
    }
    CHECK(nlohmann::json::parse(TextRunsJson("", true)) == nlohmann::json::array());
}

TEST_CASE("A sheet as JSON tells for each played bar which drawn one it is") {
    struct CCase {
        std::string_view mText;
        std::size_t mDrawn;
        std::vector<int> mPlayed;
    };
    const std::vector<CCase> cases{
        {"C | F | G7 | C", 4, {0, 1, 2, 3}},
        {"C F", 1, {0}},
        {"|: C | F :| G7 | C", 4, {0, 1, 0, 1, 2, 3}},
        {"|: C | F [1 G7 :| [2 C |", 4, {0, 1, 2, 0, 1, 3}},
        {"C | F Fine | G | D.C. al Fine", 3, {0, 1, 2, 0, 1}},
        {"", 0, {}},
    };
    for (const CCase& each : cases) {
        const std::string text(each.mText);
        CAPTURE(text);
        const nlohmann::json sheet = SheetOf(each.mText);
        CHECK(sheet["Bars"].size() == each.mDrawn);
        CHECK(PlayedBars(sheet) == each.mPlayed);
    }
}

}  // namespace brindle::test
