// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Output.h"

#include <string>

namespace brindle {
class CChordLite;
struct CRomanTextReading;
}  // namespace brindle

namespace brindle::cli {

/// A symbol that the program reads as the same chord.
[[nodiscard]] std::string SymbolOf(const CChordLite& chord);

/// An analysis as a table, a line for each chord.
[[nodiscard]] std::string RomanTextText(const CRomanTextReading& reading, const CPaint& paint);

/// The same as JSON, with bars, keys and time signatures.
[[nodiscard]] std::string RomanTextJson(const CRomanTextReading& reading);

}  // namespace brindle::cli
