// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

namespace brindle::cli {

/// The folder `share/<name>` beside the folder of the program, which may have been moved; empty if
/// it is not there.
[[nodiscard]] std::filesystem::path SharedFolderOfProgram(const char* name);

/// Lets the library find the data that come with the program; without them it looks where they were
/// installed.
void UseDataOfProgram();

}  // namespace brindle::cli
