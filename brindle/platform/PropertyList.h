// SPDX-License-Identifier: MIT
#pragma once

#include <nlohmann/json_fwd.hpp>
#include <string>

namespace brindle {

/// A value as a property list in XML form: dictionaries, arrays, texts, numbers and truth values.
/// Null, which property lists do not have, becomes an empty text. A library that was built with
/// BRINDLE_GRID_FILES=OFF gives an empty text for all.
[[nodiscard]] std::string PropertyListXml(const nlohmann::json& value);

}  // namespace brindle
