// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/KeyTables.h"
#include "brindle/analysis/CKeyOfSong.h"

#include <doctest/doctest.h>
#include <nlohmann/json.hpp>

#include <fstream>

namespace brindle::test {
namespace {

nlohmann::json KeyTablesJson() {
    std::ifstream file(BRINDLE_SOURCE_DIR "/data/key-tables.json");
    return nlohmann::json::parse(file, nullptr, false);
}

TEST_CASE("The tables of keys hold what their JSON holds") {
    const nlohmann::json json = KeyTablesJson();
    REQUIRE(json.is_object());
    CHECK(json.size() == 8);
    CHECK(json["time"] == nlohmann::json(kKeyTimeTable));
    CHECK(json["bass"] == nlohmann::json(kKeyBassTable));
    CHECK(json["first"] == nlohmann::json(kKeyFirstTable));
    CHECK(json["last"] == nlohmann::json(kKeyLastTable));
    CHECK(json["step"] == nlohmann::json(kKeyStepTable));
    CHECK(json["local"] == nlohmann::json(kKeyLocalTable));
    CHECK(json["change"] == nlohmann::json{{"base", kKeyChangeCosts.mBase},
                                           {"fifth", kKeyChangeCosts.mFifth},
                                           {"parallel", kKeyChangeCosts.mParallel}});
    CHECK(json["home"] == kKeyHomeBonus);
}

TEST_CASE("Without options a song is heard by the figures of the tables") {
    const CKeyOptions options;
    CHECK(options.mHomeBonus == kKeyHomeBonus);
    CHECK(options.mChangeCost == kKeyChangeCosts.mBase);
}

}  // namespace
}  // namespace brindle::test
