// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/ReadKeyText.h"

#include <optional>
#include <string_view>

namespace brindle::cli {

/// Reads what was typed behind --key. Nothing when that is no key; then the error has been printed.
[[nodiscard]] std::optional<CSignKeyLite> ReadKeyOption(std::string_view typed);

}  // namespace brindle::cli
