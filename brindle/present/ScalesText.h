// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/theory/CScaleHeavy.h"

#include <span>
#include <string>

namespace brindle {

/// What there is to know about scales: notes as they are spelled, semitones, mask, type and signs,
/// a block of lines for each, with a blank line between.
[[nodiscard]] std::string ScalesText(std::span<const CScaleHeavy> scales, const CPaint& paint);

/// The same as JSON, see docs/json.md.
[[nodiscard]] std::string ScalesJson(std::span<const CScaleHeavy> scales);

}  // namespace brindle
