// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSignKeyLite.h"

#include <string>
#include <vector>

namespace brindle {

/// A key as sentences name it, in the language of the user: "B minor", "h-Moll", "si mineur". A
/// root with a double accidental is spelled with the least signs. Empty for an undefined key.
[[nodiscard]] std::string TonalityName(const CSignKeyLite& key);

/// The English names that catalogues translate: each letter plain, flat and sharp, in both types.
[[nodiscard]] std::vector<std::string> EnglishTonalityNames();

}  // namespace brindle
