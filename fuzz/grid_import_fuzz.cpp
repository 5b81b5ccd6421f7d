// SPDX-License-Identifier: MIT
// Any JSON as packages of fingerings: what is read of it can be drawn, and written as JSON it reads
// as the same.

#include "brindle/platform/FileNode.h"
#include "brindle/present/GridPackageJson.h"
#include "brindle/present/GridsSvg.h"
#include "brindle/present/GridsText.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <nlohmann/json.hpp>
#include <vector>

namespace {

using namespace brindle;
using Json = nlohmann::ordered_json;

constexpr std::size_t kMostGrids = 20;

void Draw(const GChDatabase& database) {
    std::vector<CChordGrid> grids;
    for (const auto& library : database.allLibrariesForAnyTuning()) {
        for (const auto& chord : library->basicChords()) {
            if (grids.size() == kMostGrids) break;
            grids.push_back(GridOfChord("", *GChChord::make(chord, 0), 0));
        }
    }
    if (GridsSvg(grids, "").empty()) std::abort();
    (void)GridsText(grids, CPaint(false));
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const Json json = Json::parse(data, data + size, nullptr, false);
    if (json.is_discarded()) return 0;
    GChDatabase database;
    if (!ReadDatabase(json, database).empty()) return 0;
    const Json written = DatabaseToJson(database);
    GChDatabase again;
    if (!ReadDatabase(written, again).empty() || DatabaseToJson(again) != written) std::abort();
    GChDatabase kept;
    kept.readFromDbPackageWrapper(database.writeLibrariesToDbPackageWrapper(false), {});
    Draw(database);
    return 0;
}
