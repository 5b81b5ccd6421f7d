// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/RomanNumeral.h"

#include <string>
#include <string_view>

namespace brindle {

struct CNumeralsReading;
struct CRomanTextReading;

// Chords with their numerals as JSON, in one shape for both sources of them, see docs/json.md. The
// text is that which was read: faults quote it.

/// Words of one key, numerals or chords. The numerals are written by the options; for words that
/// are chords, the symbols are those of the text.
[[nodiscard]] std::string NumeralsJson(const CNumeralsReading& reading, std::string_view text,
                                       const CSignKeyLite& key, bool areNumerals,
                                       const CNumeralOptions& options);

/// An analysis; the numerals are as it has them. Each chord has its key, position and length, too,
/// and beside the chords stand headers, bars, keys and time signatures.
[[nodiscard]] std::string RomanTextJson(const CRomanTextReading& reading, std::string_view text);

}  // namespace brindle
