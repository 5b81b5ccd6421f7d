// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

namespace brindle::cli {

using Json = nlohmann::ordered_json;

/// Key number, spelling and name; null for the undefined key.
[[nodiscard]] Json KeyEnhToJson(const CKeyEnh& keyEnh);

[[nodiscard]] Json KeyEnhsToJson(const std::vector<CKeyEnh>& keys);

/// The semitones of a mask in ascending order.
[[nodiscard]] Json IntervalsToJson(CSemitones semitones);

/// A position, a length or a probability; null when it is undefined.
[[nodiscard]] Json NumberToJson(double number);

/// Strict JSON text for people, too: what fits on a line stands on a line.
[[nodiscard]] std::string JsonText(const Json& json);

}  // namespace brindle::cli
