// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"

#include <string_view>

namespace brindle {

/// Whether what stands behind a root would take its second sign: `Dbb6` is D flat with a flat six,
/// and `B##9` has a sharp nine; a blank between them keeps the sign at the root.
[[nodiscard]] bool TakesSignOf(const CKeyEnh& root, std::string_view suffix);

}  // namespace brindle
