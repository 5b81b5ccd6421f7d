// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChLibrary.h"
#include "brindle/platform/AtomicFile.h"

#include <array>
#include <cstdio>

namespace brindle {

namespace fs = std::filesystem;

namespace {

/// A path in the folder that nothing stands at, made from an address.
fs::path FreePath(const fs::path& folder, std::uintptr_t number) {
    for (;; ++number) {
        std::array<char, 32> name{};
        std::snprintf(name.data(), name.size(), "0x%lx", static_cast<unsigned long>(number));
        fs::path path = folder / name.data();
        std::error_code error;
        if (!fs::exists(fs::symlink_status(path, error))) return path;
    }
}

/// Replaces a file of a package. What a kill leaves unfinished lies beside the package, where no
/// reader takes it for a library; if that place is not to be had, in it.
bool WriteLibraryFile(const fs::path& path, const std::string& content) {
    std::error_code error;
    const fs::path besidePackage = fs::absolute(path, error).parent_path().parent_path();
    return WriteFileAtomically(path, content, besidePackage) || WriteFileAtomically(path, content);
}

}  // namespace

bool GChLibrary::updateLibraryFile(const fs::path& packagePath) {
    std::error_code error;
    const bool isNew = mLibraryPath.empty();
    if (isNew ? packagePath.empty() : !fs::is_regular_file(mLibraryPath, error)) return true;
    const std::string content = wholeLibraryFileContent();
    const fs::path path =
        isNew ? FreePath(packagePath, reinterpret_cast<std::uintptr_t>(this)) : mLibraryPath;
    if (content.empty() || !WriteLibraryFile(path, content)) return false;
    // Only now: a library whose path holds no file is never written again.
    mLibraryPath = path;
    return true;
}

}  // namespace brindle
