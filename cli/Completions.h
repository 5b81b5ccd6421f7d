// SPDX-License-Identifier: MIT
#pragma once

#include "cli/CommandPage.h"

#include <string>

namespace brindle::cli {

// What the shell reads to complete commands, options, their choices and names of files.

[[nodiscard]] std::string BashCompletion(const CCommandPage& program);
[[nodiscard]] std::string ZshCompletion(const CCommandPage& program);
[[nodiscard]] std::string FishCompletion(const CCommandPage& program);

}  // namespace brindle::cli
