// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

namespace brindle {

/// The folder with the data that come with the library: where it was installed, unless the host has
/// told another.
[[nodiscard]] std::filesystem::path ResourceFolder();

/// Tells where the data lie; an empty path brings the installed ones back. Not to be called while
/// another thread reads the folder.
void SetResourceFolder(const std::filesystem::path& folder);

}  // namespace brindle
