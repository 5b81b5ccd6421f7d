// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/FileNode.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace brindle {

/// Most that the files of one container may hold together when unpacked, in bytes.
inline constexpr std::uint64_t kZipMaxUnpackedSize = 256u << 20;
/// Most files and folders of one container.
inline constexpr std::int64_t kZipMaxEntries = 10'000;

/// Unpacks a zip container in memory. Nothing when the bytes are no zip archive, when one of its
/// files is damaged or encrypted, or when a limit is passed. Sizes that the archive states are
/// never trusted. Entries that are named like a folder and like a file, and absolute or ".." paths,
/// are only names here: nothing is written anywhere. Nothing at all in a library that was built
/// with BRINDLE_SCORES=OFF.
[[nodiscard]] std::optional<FileNode> UnpackZip(std::string_view bytes);

}  // namespace brindle
