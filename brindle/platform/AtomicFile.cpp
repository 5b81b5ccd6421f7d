// SPDX-License-Identifier: MIT
#include "brindle/platform/AtomicFile.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdlib>

namespace brindle {

namespace {

bool WriteAll(int file, std::string_view bytes) {
    while (!bytes.empty()) {
        const ssize_t count = write(file, bytes.data(), bytes.size());
        if (count < 0 && errno == EINTR) continue;
        if (count <= 0) return false;
        bytes.remove_prefix(static_cast<std::size_t>(count));
    }
    return true;
}

// The rights of the file that is replaced, else those that a new file gets.
mode_t RightsFor(const std::filesystem::path& path) {
    struct stat status {};
    if (stat(path.c_str(), &status) == 0) return status.st_mode & 07777;
    const mode_t mask = umask(0);
    umask(mask);
    return 0666 & ~mask;
}

void FlushFolder(const std::filesystem::path& folder) {
    const int file =
        open(folder.empty() ? "." : folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (file < 0) return;
    fsync(file);
    close(file);
}

}  // namespace

bool WriteFileAtomically(const std::filesystem::path& path, std::string_view bytes) {
    std::string beside = path.string() + ".XXXXXX";
    const int file = mkostemp(beside.data(), O_CLOEXEC);
    if (file < 0) return false;
    bool ok = fchmod(file, RightsFor(path)) == 0 && WriteAll(file, bytes) && fsync(file) == 0;
    ok = close(file) == 0 && ok;
    ok = ok && rename(beside.c_str(), path.c_str()) == 0;
    if (!ok) {
        unlink(beside.c_str());
        return false;
    }
    FlushFolder(path.parent_path());
    return true;
}

std::optional<std::string> ReadWholeFile(const std::filesystem::path& path, std::size_t limit) {
    const int file = open(path.c_str(), O_RDONLY | O_CLOEXEC);
    if (file < 0) return std::nullopt;
    std::string bytes;
    struct stat status {};
    if (fstat(file, &status) == 0 && status.st_size > 0) {
        bytes.reserve(std::min(limit, static_cast<std::size_t>(status.st_size)));
    }
    std::array<char, 65536> buffer;
    ssize_t count = 0;
    do {
        count = read(file, buffer.data(), buffer.size());
        if (count > 0) bytes.append(buffer.data(), static_cast<std::size_t>(count));
    } while ((count > 0 && bytes.size() <= limit) || (count < 0 && errno == EINTR));
    close(file);
    if (count < 0 || bytes.size() > limit) return std::nullopt;
    return bytes;
}

}  // namespace brindle
