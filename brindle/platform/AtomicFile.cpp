// SPDX-License-Identifier: MIT
#include "brindle/platform/AtomicFile.h"

#include "brindle/platform/internal/WholeFiles.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstdlib>
#include <ostream>
#include <streambuf>

namespace brindle {

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

/// `scratch` is the path with whose name, and some letters behind it, the bytes are first written.
template <class WriteBytes>
bool ReplaceFile(const std::filesystem::path& path, const std::filesystem::path& scratch,
                 mode_t rights, WriteBytes writeBytes) {
    std::string beside = scratch.string() + ".XXXXXX";
    const int file = mkostemp(beside.data(), O_CLOEXEC);
    if (file < 0) return false;
    bool ok = fchmod(file, rights) == 0 && writeBytes(file) && fsync(file) == 0;
    ok = close(file) == 0 && ok;
    ok = ok && rename(beside.c_str(), path.c_str()) == 0;
    if (!ok) {
        unlink(beside.c_str());
        return false;
    }
    WholeFiles::FlushFolder(path.parent_path());
    return true;
}

}  // namespace

bool WriteFileAtomically(const std::filesystem::path& path, std::string_view bytes,
                         const std::filesystem::path& scratchFolder) {
    const std::filesystem::path scratch =
        scratchFolder.empty() ? path : scratchFolder / path.filename();
    return ReplaceFile(path, scratch, WholeFiles::RightsFor(path, 0666),
                       [bytes](int file) { return WholeFiles::WriteAll(file, bytes); });
}

bool WritePrivateFileAtomically(const std::filesystem::path& path, std::string_view bytes) {
    return ReplaceFile(path, path, 0600,
                       [bytes](int file) { return WholeFiles::WriteAll(file, bytes); });
}

bool WriteFileAtomically(const std::filesystem::path& path,
                         const std::function<void(std::ostream&)>& write) {
    return ReplaceFile(path, path, WholeFiles::RightsFor(path, 0666), [&write](int file) {
        CFileBuffer buffer(file);
        std::ostream stream(&buffer);
        write(stream);
        return stream.flush().good();
    });
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
