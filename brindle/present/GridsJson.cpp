// SPDX-License-Identifier: MIT
#include "brindle/present/GridsJson.h"

#include "brindle/present/JsonValues.h"
#include "brindle/present/internal/GridValues.h"

#include <nlohmann/json.hpp>

namespace brindle {

std::string GridsJson(const std::vector<CChordGrid>& grids, const CGridStyle& style) {
    Json list = Json::array();
    for (const CChordGrid& grid : grids) list.push_back(GridToJson(grid));
    return JsonText({{"LeftHanded", style.mLeftHanded}, {"Grids", list}});
}

}  // namespace brindle
