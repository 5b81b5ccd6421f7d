// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsChords.h"

#include <string>
#include <string_view>
#include <vector>

namespace brindle {

struct TChordStringParse;

/// Reading chord texts: chord symbols, bar lines and hold marks between white space.
namespace ParseStringIntoHarmAnlsChords {

/// The chords of the text with their positions, and the end marker behind them. A token that is
/// no chord symbol becomes an undefined chord that takes up its time. A text without chords gives
/// an empty list.
[[nodiscard]] CHarmAnlsChords ParseIntoChords(std::string_view text,
                                              const TChordStringParse& parse);

/// Joins symbols that were written with a blank inside: "C", "maj7" becomes "Cmaj7".
void _CorrectTokenizationOf(std::vector<std::string>& tokens);

}  // namespace ParseStringIntoHarmAnlsChords
}  // namespace brindle
