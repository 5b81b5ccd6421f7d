// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChDatabase.h"

#include <nlohmann/json_fwd.hpp>
#include <string>

namespace brindle {

/// All of a database as JSON, see docs/json.md.
[[nodiscard]] nlohmann::ordered_json DatabaseToJson(const GChDatabase& database);

/// Adds what JSON of that form holds, its libraries without files. Empty when all is well, else
/// what is wrong and where.
[[nodiscard]] std::string ReadDatabase(const nlohmann::ordered_json& json, GChDatabase& database);

/// Whether the files of a package give back what is written into them: they cannot keep every
/// fingering that JSON can tell.
[[nodiscard]] bool CanPackageKeep(const GChDatabase& database);

}  // namespace brindle
