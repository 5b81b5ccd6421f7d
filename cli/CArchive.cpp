// SPDX-License-Identifier: MIT
#include "cli/CArchive.h"

#include <archive.h>
#include <archive_entry.h>

#include <algorithm>
#include <array>
#include <utility>

namespace brindle::cli {
namespace {

using namespace std::string_view_literals;

constexpr std::size_t kBlockBytes = 1 << 16;
/// What a member without bytes takes of the budget: its head.
constexpr std::uint64_t kHeadBytes = 512;

/// What files of archives and compressed files begin with.
constexpr auto kMagics =
    std::to_array<std::string_view>({"PK\3\4"sv, "PK\5\6"sv, "\x1F\x8B"sv, "BZh"sv,
                                     "\xFD"
                                     "7zXZ\0"sv,
                                     "\x28\xB5\x2F\xFD"sv});

archive* NewArchive() {
    archive* const made = archive_read_new();
    if (made == nullptr) throw std::bad_alloc();
    archive_read_support_format_tar(made);
    archive_read_support_format_zip(made);
    archive_read_support_filter_gzip(made);
    archive_read_support_filter_bzip2(made);
    archive_read_support_filter_xz(made);
    archive_read_support_filter_zstd(made);
    return made;
}

// As it is told; bytes that the locale does not know stay as they are.
std::string NameOfEntry(archive_entry* entry) {
    const char* name = archive_entry_pathname_utf8(entry);
    if (name == nullptr) name = archive_entry_pathname(entry);
    return name == nullptr ? "" : name;
}

}  // namespace

bool LooksLikeArchive(std::string_view begin) {
    constexpr std::size_t placeInTar = 257;
    if (begin.size() > placeInTar && begin.substr(placeInTar).starts_with("ustar")) return true;
    return std::any_of(kMagics.begin(), kMagics.end(),
                       [&](std::string_view magic) { return begin.starts_with(magic); });
}

void CArchive::CCloser::operator()(archive* opened) const {
    archive_read_free(opened);
}

CArchive::CArchive(const std::filesystem::path& path, std::shared_ptr<CUnpackingBudget> budget)
    : mBudget(std::move(budget)), mArchive(NewArchive()) {
    Opened(archive_read_open_filename(mArchive.get(), path.c_str(), kBlockBytes));
}

CArchive::CArchive(std::string bytes, std::shared_ptr<CUnpackingBudget> budget)
    : mBudget(std::move(budget)), mBytes(std::move(bytes)), mArchive(NewArchive()) {
    Opened(archive_read_open_memory(mArchive.get(), mBytes.data(), mBytes.size()));
}

void CArchive::Opened(int status) {
    // Beside the one that hands on the bytes of the file.
    constexpr int mostFilters = 2;
    if (status != ARCHIVE_OK) {
        (void)GiveUp(LibraryFault());
    } else if (archive_filter_count(mArchive.get()) > mostFilters) {
        (void)GiveUp("it is compressed more than once");
    }
}

bool CArchive::GiveUp(std::string_view fault) {
    mFault = fault;
    mArchive.reset();
    return false;
}

std::string CArchive::LibraryFault() const {
    const char* const told = archive_error_string(mArchive.get());
    return std::string("it cannot be unpacked: ") + (told == nullptr ? "damaged" : told);
}

bool CArchive::Next() {
    constexpr auto tooMuch = "it holds more than 200 times its own size";
    while (mArchive != nullptr) {
        const int status = archive_read_next_header(mArchive.get(), &mEntry);
        if (status == ARCHIVE_EOF) return false;
        if (status < ARCHIVE_WARN) return GiveUp(LibraryFault());
        if (!mBudget->Take(kHeadBytes)) return GiveUp(tooMuch);
        if (archive_entry_filetype(mEntry) != AE_IFREG && !IsLink()) continue;
        const auto size =
            static_cast<std::uint64_t>(std::max<la_int64_t>(0, archive_entry_size(mEntry)));
        if (size > kMostBytesOfFile && !mBudget->Take(size)) return GiveUp(tooMuch);
        mName = NameOfEntry(mEntry);
        return true;
    }
    return false;
}

bool CArchive::IsLink() const {
    return archive_entry_filetype(mEntry) == AE_IFLNK || archive_entry_hardlink(mEntry) != nullptr;
}

std::optional<std::string> CArchive::Read(std::string& reason) {
    if (IsLink()) {
        reason = "it is a link, and links in archives are not followed";
        return std::nullopt;
    }
    std::string bytes;
    std::array<char, kBlockBytes> buffer;
    while (true) {
        const la_ssize_t count = archive_read_data(mArchive.get(), buffer.data(), buffer.size());
        if (count == 0) return bytes;
        if (count < 0) {
            reason = LibraryFault();
            return std::nullopt;
        }
        bytes.append(buffer.data(), static_cast<std::size_t>(count));
        if (bytes.size() > kMostBytesOfFile) {
            reason = "it is larger than 64 MiB";
            return std::nullopt;
        }
        if (!mBudget->Take(static_cast<std::uint64_t>(count))) {
            reason = "its archive holds more than 200 times its own size";
            return std::nullopt;
        }
    }
}

bool CArchive::IsScore() {
    // The first file of a container, or nearly so.
    constexpr int mostLookedAt = 16;
    for (int i = 0; i < mostLookedAt && Next(); ++i) {
        if (mName == "META-INF/container.xml") return true;
    }
    return false;
}

}  // namespace brindle::cli
