// SPDX-License-Identifier: MIT
#include "brindle/platform/AtomicFile.h"

#include "brindle/platform/internal/ScratchEntries.h"
#include "brindle/platform/internal/WholeFiles.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <ostream>
#include <streambuf>
#include <utility>

namespace brindle {

namespace fs = std::filesystem;

namespace {

/// The buffer of a stream that writes to an open file.
class CFileBuffer : public std::streambuf {
public:
    explicit CFileBuffer(int file) : mFile(file) { StartAgain(); }

protected:
    int_type overflow(int_type c) override {
        if (sync() != 0) return traits_type::eof();
        if (!traits_type::eq_int_type(c, traits_type::eof())) {
            sputc(traits_type::to_char_type(c));
        }
        return traits_type::not_eof(c);
    }
    int sync() override {
        const bool ok =
            WholeFiles::WriteAll(mFile, {pbase(), static_cast<std::size_t>(pptr() - pbase())});
        StartAgain();
        return ok ? 0 : -1;
    }

private:
    void StartAgain() { setp(mBytes.data(), mBytes.data() + mBytes.size()); }

    int mFile;
    std::array<char, 65536> mBytes;
};

/// An open file that is closed at its end; the reason of a failure before stays in errno.
class COpenFile {
public:
    explicit COpenFile(int file) : mFile(file) {}
    COpenFile(const COpenFile&) = delete;
    COpenFile& operator=(const COpenFile&) = delete;
    ~COpenFile() {
        const int reason = errno;
        (void)Close();
        errno = reason;
    }

    [[nodiscard]] bool IsOpen() const { return mFile >= 0; }
    [[nodiscard]] int Get() const { return mFile; }
    [[nodiscard]] bool Close() { return close(std::exchange(mFile, -1)) == 0; }

private:
    int mFile;
};

using TWriteBytes = std::function<bool(int file)>;

/// Writes to `scratch`, with some letters behind it, and renames that. The rights are exact, or
/// those of a new file where `rights` is null.
bool ReplaceFile(const fs::path& path, fs::path scratch, const mode_t* rights,
                 const TWriteBytes& writeBytes) {
    constexpr mode_t kNewFileRights = 0666;
    ScratchEntries::RemoveOld(scratch, ScratchEntries::TEntry::File);
    COpenFile file(
        ScratchEntries::OpenNewFile(scratch, rights != nullptr ? *rights : kNewFileRights));
    if (!file.IsOpen()) return false;
    const ScratchEntries::CRemover remover(scratch);
    const bool ok = (rights == nullptr || fchmod(file.Get(), *rights) == 0) &&
                    writeBytes(file.Get()) && fsync(file.Get()) == 0;
    if (!ok || !file.Close() || rename(scratch.c_str(), path.c_str()) != 0) return false;
    WholeFiles::FlushFolder(path.parent_path());
    return true;
}

/// A device, a pipe or the like keeps what it is.
bool WriteInto(const fs::path& path, const TWriteBytes& writeBytes) {
    COpenFile file(open(path.c_str(), O_WRONLY | O_NOCTTY | O_CLOEXEC));
    if (!file.IsOpen()) return false;
    return writeBytes(file.Get()) && file.Close();
}

bool FailFor(int reason) {
    errno = reason;
    return false;
}

bool WriteFile(const fs::path& path, const fs::path& scratchFolder, const TWriteBytes& writeBytes) {
    struct stat status {};
    const bool isThere = stat(path.c_str(), &status) == 0;
    if (isThere && S_ISDIR(status.st_mode)) return FailFor(EISDIR);
    // By its own name: a link such as /dev/fd/3 to a pipe names no file that could be followed.
    if (isThere && !S_ISREG(status.st_mode)) return WriteInto(path, writeBytes);
    const auto target = WholeFiles::BehindLinks(path);
    if (!target) return FailFor(ELOOP);
    const fs::path scratch = scratchFolder.empty() ? *target : scratchFolder / target->filename();
    const mode_t rights = isThere ? status.st_mode & 07777 : 0;
    return ReplaceFile(*target, scratch, isThere ? &rights : nullptr, writeBytes);
}

}  // namespace

bool WriteFileAtomically(const fs::path& path, std::string_view bytes,
                         const fs::path& scratchFolder) {
    return WriteFile(path, scratchFolder,
                     [bytes](int file) { return WholeFiles::WriteAll(file, bytes); });
}

bool WriteFileAtomically(const fs::path& path, const std::function<void(std::ostream&)>& write) {
    return WriteFile(path, {}, [&write](int file) {
        CFileBuffer buffer(file);
        std::ostream stream(&buffer);
        write(stream);
        return stream.flush().good();
    });
}

bool WritePrivateFileAtomically(const fs::path& path, std::string_view bytes) {
    constexpr mode_t kPrivate = 0600;
    return ReplaceFile(path, path, &kPrivate,
                       [bytes](int file) { return WholeFiles::WriteAll(file, bytes); });
}

std::optional<std::string> ReadWholeFile(const fs::path& path, std::size_t limit) {
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
