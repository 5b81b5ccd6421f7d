// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/FileNode.h"

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string_view>

namespace brindle {

/// Most that the files of a folder may hold together when it is read, in bytes.
inline constexpr std::uint64_t kFolderMaxSize = std::uint64_t{1} << 30;

/// The files of a folder with their contents, and its folders as empty folders. What is neither,
/// what cannot be read, and what would pass `limit` is left out. Nothing when there is no such
/// folder.
[[nodiscard]] std::optional<FileNode> ReadFolder(const std::filesystem::path& path,
                                                 std::uint64_t limit = kFolderMaxSize);

/// Replaces the folder at `path` by a tree as a whole: the tree is written beside it under a name
/// that nobody can foresee, flushed to the disk and put in its place in one step, and what stood
/// there is removed. A full disk or a kill leaves the old folder as it was or the new one whole.
///
/// Where the system cannot exchange two folders in one step, the old one is moved aside first: a
/// kill just then leaves it beside. False when it failed, when the tree is no folder or has a name
/// that no file can have, and when something other than a folder stands at the path; nothing is
/// left behind then. A link is followed, also one to nothing. So are links in the folder that lead
/// out of it, where the tree has a file of that name: they stay, and what they name is replaced,
/// each for itself, before the folder is. What a kill has left is removed by the next writer of the
/// folder after an hour.
[[nodiscard]] bool WriteFolderAtomically(const std::filesystem::path& path, const FileNode& tree);

/// The path with the user's home folder for a "~" at its start.
[[nodiscard]] std::filesystem::path ExpandTilde(std::string_view path);

}  // namespace brindle
