// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string_view>

/// What writing a file and writing a folder as a whole have in common.
namespace brindle::WholeFiles {

/// Writes all bytes to an open file.
[[nodiscard]] bool WriteAll(int file, std::string_view bytes);

/// Flushes the entries of a folder to the disk; "" is the current one.
void FlushFolder(const std::filesystem::path& folder);

/// The rights of what stands at the path, else `usual` without what the process masks.
[[nodiscard]] unsigned RightsFor(const std::filesystem::path& path, unsigned usual);

}  // namespace brindle::WholeFiles
