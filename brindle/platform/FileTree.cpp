// SPDX-License-Identifier: MIT
#include "brindle/platform/FileTree.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/internal/ScratchEntries.h"
#include "brindle/platform/internal/WholeFiles.h"

#include <fcntl.h>
#include <pwd.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <string>

namespace brindle {

namespace fs = std::filesystem;

namespace {

constexpr mode_t kUsualFileRights = 0666;
constexpr mode_t kUsualFolderRights = 0777;

bool IsEntryName(std::string_view name) {
    return !name.empty() && name != "." && name != ".." && name.find('/') == name.npos &&
           name.find('\0') == name.npos;
}

bool WriteNewFile(const fs::path& path, std::string_view bytes) {
    const int file = open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, kUsualFileRights);
    if (file < 0) return false;
    const bool ok = WholeFiles::WriteAll(file, bytes) && fsync(file) == 0;
    return close(file) == 0 && ok;
}

/// Whether a link stands at the path that leads out of its folder.
bool LeadsOut(const fs::path& path) {
    std::error_code error;
    if (!fs::is_symlink(fs::symlink_status(path, error))) return false;
    const auto behind = WholeFiles::BehindLinks(path);
    if (!behind) return false;
    const fs::path target = fs::weakly_canonical(*behind, error);
    if (error) return false;
    const fs::path folder = fs::weakly_canonical(path.parent_path(), error);
    return !error &&
           std::mismatch(folder.begin(), folder.end(), target.begin(), target.end()).first !=
               folder.end();
}

bool CopyLink(const fs::path& link, const fs::path& copy) {
    std::error_code error;
    fs::copy_symlink(link, copy, error);
    return !error;
}

/// Fills a folder that is there and empty. Links that lead out of `old`, which it is to replace,
/// are in it again.
bool FillFolder(const fs::path& folder, const FileNode& tree, const fs::path& old) {
    for (const auto& [name, child] : tree.mChildren) {
        if (!IsEntryName(name)) return false;
        const fs::path path = folder / name;
        bool ok = false;
        if (child.mIsFolder) {
            ok =
                mkdir(path.c_str(), kUsualFolderRights) == 0 && FillFolder(path, child, old / name);
        } else if (LeadsOut(old / name)) {
            ok = CopyLink(old / name, path);
        } else {
            ok = WriteNewFile(path, child.mContents);
        }
        if (!ok) return false;
    }
    WholeFiles::FlushFolder(folder);
    return true;
}

/// Writes what stands behind the links of a folder that was filled.
bool WriteBehindLinks(const fs::path& folder, const FileNode& tree) {
    return std::all_of(tree.mChildren.begin(), tree.mChildren.end(), [&](const auto& entry) {
        const auto& [name, child] = entry;
        const fs::path path = folder / name;
        if (child.mIsFolder) return WriteBehindLinks(path, child);
        std::error_code ignored;
        return !fs::is_symlink(fs::symlink_status(path, ignored)) ||
               WriteFileAtomically(path, child.mContents);
    });
}

/// Exchanges two folders in one step; false where the system cannot.
bool Exchange(const fs::path& a, const fs::path& b) {
#if defined(RENAME_EXCHANGE)
    return renameat2(AT_FDCWD, a.c_str(), AT_FDCWD, b.c_str(), RENAME_EXCHANGE) == 0;
#elif defined(RENAME_SWAP)
    return renamex_np(a.c_str(), b.c_str(), RENAME_SWAP) == 0;
#else
    (void)a, (void)b;
    return false;
#endif
}

bool MoveAside(const fs::path& fresh, const fs::path& path) {
    const fs::path aside = fresh.string() + ".old";
    if (rename(path.c_str(), aside.c_str()) != 0) return false;
    if (rename(fresh.c_str(), path.c_str()) == 0) {
        return rename(aside.c_str(), fresh.c_str()) == 0;
    }
    (void)rename(aside.c_str(), path.c_str());
    return false;
}

/// Gives a folder the rights of the one that it replaces.
bool TakeRightsOf(const fs::path& old, const fs::path& fresh) {
    struct stat status {};
    return stat(old.c_str(), &status) != 0 || chmod(fresh.c_str(), status.st_mode & 07777) == 0;
}

/// Puts a folder to where it belongs; what stood there has its name then.
bool PutInPlace(const fs::path& fresh, const fs::path& path) {
    std::error_code ignored;
    const fs::file_status status = fs::symlink_status(path, ignored);
    if (!fs::exists(status)) return rename(fresh.c_str(), path.c_str()) == 0;
    if (!fs::is_directory(status)) return false;
    return Exchange(fresh, path) || MoveAside(fresh, path);
}

}  // namespace

std::optional<FileNode> ReadFolder(const fs::path& path, std::uint64_t limit) {
    std::error_code error;
    fs::directory_iterator entries(path, error);
    if (error) return std::nullopt;
    FileNode root;
    root.mIsFolder = true;
    for (; entries != fs::directory_iterator(); entries.increment(error)) {
        std::error_code ignored;
        FileNode node;
        node.mIsFolder = entries->is_directory(ignored);
        if (!node.mIsFolder) {
            if (!entries->is_regular_file(ignored) || entries->file_size(ignored) > limit) continue;
            auto bytes = ReadWholeFile(entries->path(), static_cast<std::size_t>(limit));
            if (!bytes) continue;
            limit -= bytes->size();
            node.mContents = std::move(*bytes);
        }
        root.mChildren.emplace(entries->path().filename().string(), std::move(node));
    }
    return root;
}

bool WriteFolderAtomically(const fs::path& path, const FileNode& tree) {
    if (!tree.mIsFolder) return false;
    const auto target = WholeFiles::BehindLinks(path.has_filename() ? path : path.parent_path());
    if (!target) return false;
    fs::path beside = *target;
    ScratchEntries::RemoveOld(*target, ScratchEntries::TEntry::Folder);
    if (!ScratchEntries::MakeNewFolder(beside, kUsualFolderRights)) return false;
    // Behind an exchange it is the old folder, else what could not be put in its place.
    const ScratchEntries::CRemover remover(beside);
    // Relative links lead to the same place from here, as both folders lie in one.
    const bool ok = FillFolder(beside, tree, *target) && TakeRightsOf(*target, beside) &&
                    WriteBehindLinks(beside, tree) && PutInPlace(beside, *target);
    if (ok) WholeFiles::FlushFolder(target->parent_path());
    return ok;
}

fs::path ExpandTilde(std::string_view path) {
    if (path.empty() || path[0] != '~' || (path.size() > 1 && path[1] != '/')) return path;
    const char* home = std::getenv("HOME");
    if (home == nullptr || *home == '\0') {
        const passwd* const user = getpwuid(getuid());
        home = user == nullptr ? nullptr : user->pw_dir;
    }
    if (home == nullptr) return path;
    return std::string(home).append(path.substr(1));
}

}  // namespace brindle
