// SPDX-License-Identifier: MIT
#include "cli/InputStream.h"

#include <fcntl.h>
#include <poll.h>
#include <unistd.h>

#include <array>
#include <cerrno>

namespace brindle::cli {
namespace {

/// A file that is open until it is read.
struct CStreamFile {
    explicit CStreamFile(const std::string& path)
        // Without O_NONBLOCK a named pipe is waited for as it is opened.
        : mIsInput(path == "-"),
          mFile(mIsInput ? STDIN_FILENO : open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK)) {}
    CStreamFile(const CStreamFile&) = delete;
    CStreamFile& operator=(const CStreamFile&) = delete;
    ~CStreamFile() {
        if (!mIsInput && mFile >= 0) close(mFile);
    }

    bool mIsInput;
    int mFile;
};

/// Waits until a read gives something at once: bytes, the end or an error.
bool IsReadable(int file, const std::function<bool()>& isEndAsked) {
    constexpr int pulseInMilliseconds = 100;
    pollfd waited{file, POLLIN, 0};
    while (!isEndAsked()) {
        if (poll(&waited, 1, pulseInMilliseconds) > 0) return true;
    }
    return false;
}

}  // namespace

std::optional<std::string> ReadInputStream(const std::string& path, std::size_t limit,
                                           const std::function<bool()>& isEndAsked) {
    constexpr std::size_t blockBytes = 1 << 16;
    const CStreamFile stream(path);
    std::string bytes;
    std::array<char, blockBytes> buffer;
    while (IsReadable(stream.mFile, isEndAsked)) {
        const ssize_t count = read(stream.mFile, buffer.data(), buffer.size());
        if (count == 0) return bytes;
        if (count < 0 && errno != EINTR && errno != EAGAIN) return std::nullopt;
        if (count > 0) bytes.append(buffer.data(), static_cast<std::size_t>(count));
        if (bytes.size() > limit) return std::nullopt;
    }
    return std::nullopt;
}

}  // namespace brindle::cli
