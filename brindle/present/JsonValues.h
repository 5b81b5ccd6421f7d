// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CJsonWriter.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/CSignKeyLite.h"

#include <nlohmann/json_fwd.hpp>
#include <string>
#include <vector>

namespace brindle {

/// A dictionary whose members keep their order, for small results.
using Json = nlohmann::ordered_json;

// The values that all JSON of the program shares, see docs/json.md: written straight, or as a value
// of a dictionary.

/// Pitch class, spelling and name; null for the undefined one.
void WriteKeyEnh(CJsonWriter& json, const CKeyEnh& keyEnh);
/// The same as a value.
[[nodiscard]] Json KeyEnhToJson(const CKeyEnh& keyEnh);
/// A list of such values.
[[nodiscard]] Json KeyEnhsToJson(const std::vector<CKeyEnh>& keys);

/// Name, root and type of a tonality; null for the undefined one.
void WriteSignKey(CJsonWriter& json, const CSignKeyLite& key);

/// The semitones of a mask in ascending order.
void WriteIntervals(CJsonWriter& json, CSemitones semitones);
/// The same as a value.
[[nodiscard]] Json IntervalsToJson(CSemitones semitones);

/// A position, a length or a probability; null when it is undefined.
[[nodiscard]] Json NumberToJson(double number);

/// The same text that a writer gives.
[[nodiscard]] std::string JsonText(const Json& json);

}  // namespace brindle
