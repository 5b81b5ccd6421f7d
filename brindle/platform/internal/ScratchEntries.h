// SPDX-License-Identifier: MIT
#pragma once

#include <sys/types.h>

#include <filesystem>
#include <utility>

/// Files and folders that are written under a name of their own, beside what they are to become.
/// The name is that of the target, ".brindle-" and six letters that nobody can foresee.
namespace brindle::ScratchEntries {

/// An open new file, or -1. The process's mask is taken off `rights`. `path` becomes its name.
[[nodiscard]] int OpenNewFile(std::filesystem::path& path, mode_t rights);

/// Whether there is a new folder. The process's mask is taken off `rights`.
[[nodiscard]] bool MakeNewFolder(std::filesystem::path& path, mode_t rights);

/// Removes what stands at the path at its end, if anything does. Leaves errno as it is.
class CRemover {
public:
    explicit CRemover(std::filesystem::path path) : mPath(std::move(path)) {}
    CRemover(const CRemover&) = delete;
    CRemover& operator=(const CRemover&) = delete;
    ~CRemover();

private:
    std::filesystem::path mPath;
};

/// What a writer makes under a scratch name.
enum class TEntry { File, Folder };

/// Removes what writers of this target have left that were killed more than an hour ago, as far as
/// it is of the kind. Looks at each entry of the folder.
void RemoveOld(const std::filesystem::path& path, TEntry kind);

}  // namespace brindle::ScratchEntries
