// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/present/CPaint.h"
#include "brindle/present/ImportedScore.h"

#include <string>

namespace brindle {

/// An imported score as a table for each part.
[[nodiscard]] std::string ImportText(CImportedScore score, const CPaint& paint);

}  // namespace brindle
