// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/ReadKeyText.h"

#include <optional>
#include <string_view>

namespace brindle::cli {

/// Reads what was typed behind --key. Nothing when that is no key; then the error has been printed.
[[nodiscard]] std::optional<CSignKeyLite> ReadKeyOption(std::string_view typed);
/// The same where --key may be left out: no text is the undefined key.
[[nodiscard]] std::optional<CSignKeyLite> ReadKeyIfTold(std::string_view typed);

}  // namespace brindle::cli
