// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"

#include <string>

namespace brindle {

struct CRomanTextReading;

/// An analysis as a table, a line for each chord.
[[nodiscard]] std::string RomanTextText(const CRomanTextReading& reading, const CPaint& paint);

}  // namespace brindle
