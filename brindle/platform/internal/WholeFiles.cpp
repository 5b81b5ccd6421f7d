// SPDX-License-Identifier: MIT
#include "brindle/platform/internal/WholeFiles.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>

namespace brindle::WholeFiles {

bool WriteAll(int file, std::string_view bytes) {
    while (!bytes.empty()) {
        const ssize_t count = write(file, bytes.data(), bytes.size());
        if (count < 0 && errno == EINTR) continue;
        if (count <= 0) return false;
        bytes.remove_prefix(static_cast<std::size_t>(count));
    }
    return true;
}

void FlushFolder(const std::filesystem::path& folder) {
    const int file =
        open(folder.empty() ? "." : folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (file < 0) return;
    fsync(file);
    close(file);
}

std::optional<std::filesystem::path> BehindLinks(std::filesystem::path path) {
    constexpr int kMostLinks = 40;
    for (int links = 0; links <= kMostLinks; ++links) {
        std::error_code error;
        const std::filesystem::path target = std::filesystem::read_symlink(path, error);
        if (error) return path;
        path = path.parent_path() / target;
    }
    return std::nullopt;
}

}  // namespace brindle::WholeFiles
