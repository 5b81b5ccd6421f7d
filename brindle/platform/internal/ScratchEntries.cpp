// SPDX-License-Identifier: MIT
#include "brindle/platform/internal/ScratchEntries.h"

#include "brindle/platform/Random.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <string>
#include <string_view>

namespace brindle::ScratchEntries {

namespace fs = std::filesystem;

namespace {

constexpr std::string_view kMark = ".brindle-";
constexpr std::string_view kLetters = "abcdefghijklmnopqrstuvwxyz234567";
constexpr std::size_t kLetterCount = 6;
// What no writer that lives has left untouched for so long.
constexpr auto kOld = std::chrono::hours(1);
// Names have at most 255 bytes; a long one is cut, as only its start has to be told.
constexpr std::size_t kLongestStart = 200;

std::string StartOfName(const fs::path& path) {
    return path.filename().string().substr(0, kLongestStart).append(kMark);
}

std::string RandomLetters() {
    std::string letters;
    for (std::uint32_t bits = RandomBits(); letters.size() < kLetterCount; bits /= 32) {
        letters += kLetters[bits % 32];
    }
    return letters;
}

bool IsScratchName(const std::string& name, const std::string& start) {
    return name.size() == start.size() + kLetterCount && name.starts_with(start) &&
           std::all_of(name.end() - kLetterCount, name.end(),
                       [](char c) { return kLetters.find(c) != kLetters.npos; });
}

/// Tries new names until `make` succeeds or fails for another reason than a name in use.
template <class Make>
bool MakeUnderNewName(fs::path& path, Make make) {
    constexpr int kMostTries = 100;
    const fs::path folder = path.parent_path();
    const std::string start = StartOfName(path);
    for (int tries = 0; tries < kMostTries; ++tries) {
        path = folder / (start + RandomLetters());
        if (make(path.c_str())) return true;
        if (errno != EEXIST) return false;
    }
    return false;
}

bool IsOld(const fs::path& path, TEntry kind) {
    struct stat status {};
    if (lstat(path.c_str(), &status) != 0) return false;
    if ((status.st_mode & S_IFMT) != (kind == TEntry::File ? S_IFREG : S_IFDIR)) return false;
    const auto now = std::chrono::system_clock::now();
    return std::chrono::system_clock::from_time_t(status.st_mtime) < now - kOld;
}

}  // namespace

int OpenNewFile(fs::path& path, mode_t rights) {
    int file = -1;
    (void)MakeUnderNewName(path, [&](const char* name) {
        file = open(name, O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, rights);
        return file >= 0;
    });
    return file;
}

bool MakeNewFolder(fs::path& path, mode_t rights) {
    return MakeUnderNewName(path, [&](const char* name) { return mkdir(name, rights) == 0; });
}

CRemover::~CRemover() {
    const int reason = errno;
    try {
        std::error_code ignored;
        fs::remove_all(mPath, ignored);
    } catch (const std::exception&) {
        // Without memory it stays and is removed as an old one.
    }
    errno = reason;
}

void RemoveOld(const fs::path& path, TEntry kind) {
    const std::string start = StartOfName(path);
    const fs::path folder = path.has_parent_path() ? path.parent_path() : fs::path(".");
    std::error_code error;
    for (fs::directory_iterator entries(folder, error); entries != fs::directory_iterator();
         entries.increment(error)) {
        const fs::path& entry = entries->path();
        if (!IsScratchName(entry.filename().string(), start) || !IsOld(entry, kind)) continue;
        std::error_code ignored;
        if (kind == TEntry::File) {
            fs::remove(entry, ignored);
        } else {
            fs::remove_all(entry, ignored);
        }
    }
}

}  // namespace brindle::ScratchEntries
