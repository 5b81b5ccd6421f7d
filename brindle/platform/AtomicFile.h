// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <functional>
#include <iosfwd>
#include <optional>
#include <string>
#include <string_view>

namespace brindle {

/// Replaces the file at `path` as a whole: the bytes are written beside it under a name that nobody
/// can foresee, flushed to the disk and renamed over it. A full disk or a kill leaves the old file
/// as it was. False when that failed, with the reason in errno; nothing is left behind then, as
/// when `write` throws. What a kill has left is removed by the next writer of the file after an
/// hour.
///
/// A link is followed, also one to nothing. A file keeps its rights, a new one has those that the
/// process gives. Into a device, a pipe or what else is no file the bytes are written as they come;
/// where a folder stands nothing is written.
///
/// With a folder, of the same file system, the bytes are first written there: a kill leaves nothing
/// beside the file.
[[nodiscard]] bool WriteFileAtomically(const std::filesystem::path& path, std::string_view bytes,
                                       const std::filesystem::path& scratchFolder = {});

/// The same for bytes that `write` puts on a stream, so that they never are in memory as a whole.
[[nodiscard]] bool WriteFileAtomically(const std::filesystem::path& path,
                                       const std::function<void(std::ostream&)>& write);

/// The same for a file that only its owner may read and write. A link at `path` is replaced and not
/// followed.
[[nodiscard]] bool WritePrivateFileAtomically(const std::filesystem::path& path,
                                              std::string_view bytes);

/// The whole file, or nothing when it cannot be read or is larger than `limit` bytes.
[[nodiscard]] std::optional<std::string> ReadWholeFile(const std::filesystem::path& path,
                                                       std::size_t limit = std::size_t{2} << 30);

}  // namespace brindle
