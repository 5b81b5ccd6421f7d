// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Output.h"

namespace brindle::cli {

/// All of the program but its guard: reads a command line, does what it asks for and prints that.
[[nodiscard]] TStatus RunProgram(int argc, char** argv);

}  // namespace brindle::cli
