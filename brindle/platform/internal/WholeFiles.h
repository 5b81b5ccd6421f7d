// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <optional>
#include <string_view>

/// What writing a file and writing a folder as a whole have in common.
namespace brindle::WholeFiles {

/// Writes all bytes to an open file.
[[nodiscard]] bool WriteAll(int file, std::string_view bytes);

/// Flushes the entries of a folder to the disk; "" is the current one.
void FlushFolder(const std::filesystem::path& folder);

/// What the path names behind all links; a link to nothing names what it would be. Nothing for
/// links in a ring.
[[nodiscard]] std::optional<std::filesystem::path> BehindLinks(std::filesystem::path path);

}  // namespace brindle::WholeFiles
