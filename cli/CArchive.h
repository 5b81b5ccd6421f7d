// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

struct archive;
struct archive_entry;

namespace brindle::cli {

/// Most bytes of one file, in an archive or not.
inline constexpr std::size_t kMostBytesOfFile = std::size_t{64} << 20;

/// Whether bytes that a file begins with, of 512 or all of it, are those of an archive: zip or tar,
/// the latter compressed by gzip, bzip2, xz or zstd or not at all. A score in a zip container is
/// one by these bytes.
[[nodiscard]] bool LooksLikeArchive(std::string_view begin);

/// How many bytes more an archive may hold when it is unpacked, with all archives in it. Songs are
/// packed to a tenth, at times to a fiftieth of their size; what holds much more was made to fill
/// memories.
class CUnpackingBudget {
public:
    explicit CUnpackingBudget(std::uint64_t packedBytes)
        : mLeft(kFree + kMostRatio * packedBytes) {}

    /// False when there is not so much left.
    bool Take(std::uint64_t bytes) {
        const bool isEnough = bytes <= mLeft;
        mLeft = isEnough ? mLeft - bytes : 0;
        return isEnough;
    }

private:
    static constexpr std::uint64_t kFree = std::uint64_t{256} << 20;
    static constexpr std::uint64_t kMostRatio = 200;

    std::uint64_t mLeft;
};

/// Reads the files of an archive one by one, in their order, each into memory. Nothing is written;
/// names are only names. Sizes that the archive states are not trusted. Belongs to one thread.
class CArchive {
public:
    /// An archive in a file.
    CArchive(const std::filesystem::path& path, std::shared_ptr<CUnpackingBudget> budget);
    /// An archive in memory.
    CArchive(std::string bytes, std::shared_ptr<CUnpackingBudget> budget);
    CArchive(const CArchive&) = delete;
    CArchive& operator=(const CArchive&) = delete;
    ~CArchive() = default;

    /// Goes to the next file or link. False at the end, or when the archive can be read no further;
    /// then there is a fault.
    [[nodiscard]] bool Next();
    [[nodiscard]] const std::string& Fault() const { return mFault; }

    /// Of the file that it stands at.
    [[nodiscard]] const std::string& Name() const { return mName; }
    /// Its bytes; nothing, with the reason, when they cannot be read or are too many. A link has
    /// none: what it names may lie anywhere, or before it, and has then been read.
    [[nodiscard]] std::optional<std::string> Read(std::string& reason);

    /// Whether it is a score in a container instead of an archive of songs. Ends the archive.
    [[nodiscard]] bool IsScore();

    [[nodiscard]] const std::shared_ptr<CUnpackingBudget>& Budget() const { return mBudget; }

private:
    struct CCloser {
        void operator()(archive* opened) const;
    };

    void Opened(int status);
    [[nodiscard]] bool IsLink() const;
    [[nodiscard]] bool GiveUp(std::string_view fault);
    [[nodiscard]] std::string LibraryFault() const;

    std::shared_ptr<CUnpackingBudget> mBudget;
    std::string mBytes;
    std::unique_ptr<archive, CCloser> mArchive;
    archive_entry* mEntry = nullptr;
    std::string mName;
    std::string mFault;
};

}  // namespace brindle::cli
