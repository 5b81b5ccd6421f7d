// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/guitarchords/GChDatabase.h"

#include <memory>
#include <string>

namespace brindle::cli {

/// The package at a path, or for an empty path the one that comes with the program and the user's.
/// Null when it is not there; then the error has been printed.
[[nodiscard]] std::unique_ptr<GChDatabase> ReadGrids(const std::string& packagePath);

}  // namespace brindle::cli
