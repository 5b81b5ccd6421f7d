// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/KeyTables.h"
#include "brindle/analysis/internal/ChainTables.h"

#include <doctest/doctest.h>
#include <nlohmann/json.hpp>

#include <fstream>
#include <utility>

namespace brindle::test {
namespace {

nlohmann::json ModelJson() {
    std::ifstream file(BRINDLE_SOURCE_DIR "/data/reading-model.json");
    return nlohmann::json::parse(file, nullptr, false);
}

// A table in tenths as the JSON has it.
template <class TTable>
nlohmann::json InPoints(const TTable& table) {
    nlohmann::json rows = nlohmann::json::array();
    for (const auto& row : table) {
        nlohmann::json cells = nlohmann::json::array();
        for (const auto tenths : row) cells.push_back(tenths / 10.0);
        rows.push_back(std::move(cells));
    }
    return rows;
}

TEST_CASE("The tables of keys and chains hold what their JSON holds") {
    const nlohmann::json json = ModelJson();
    REQUIRE(json.is_object());
    CHECK(json.size() == 11);
    CHECK(json["global_time"] == nlohmann::json(kKeyTimeTable));
    CHECK(json["global_bass"] == nlohmann::json(kKeyBassTable));
    CHECK(json["global_first"] == nlohmann::json(kKeyFirstTable));
    CHECK(json["global_last"] == nlohmann::json(kKeyLastTable));
    CHECK(json["global_step"] == nlohmann::json(kKeyStepTable));
    CHECK(json["local"] == nlohmann::json(kKeyLocalTable));
    CHECK(json["motion"] == InPoints(kChainMotion));
    CHECK(json["goal"] == InPoints(kChainGoal));
    CHECK(json["to"] == InPoints(kChainTo));
    CHECK(json["depth"] == InPoints(kChainDepth));
    CHECK(json["rest"] == InPoints(kChainRest));
}

}  // namespace
}  // namespace brindle::test
