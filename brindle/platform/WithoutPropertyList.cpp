// SPDX-License-Identifier: MIT
// In place of PropertyList.cpp in a library that writes no packages of fingerings
// (BRINDLE_GRID_FILES=OFF).
#include "brindle/platform/PropertyList.h"

#include <nlohmann/json.hpp>

namespace brindle {

std::string PropertyListXml(const nlohmann::json&) {
    return {};
}

}  // namespace brindle
