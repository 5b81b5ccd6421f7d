// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/theory/CSignKeyLite.h"

#include <span>
#include <string>

namespace brindle {

/// What there is to know about tonalities: signs, notes, relative tonality and one-byte code, a
/// block of lines for each, with a blank line between.
[[nodiscard]] std::string TonalitiesText(std::span<const CSignKeyLite> keys, const CPaint& paint);

/// The same as JSON, see docs/json.md. An undefined tonality has null for what it does not have.
[[nodiscard]] std::string TonalitiesJson(std::span<const CSignKeyLite> keys);

}  // namespace brindle
