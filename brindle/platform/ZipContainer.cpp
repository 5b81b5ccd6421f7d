// SPDX-License-Identifier: MIT
#include "brindle/platform/ZipContainer.h"

#include "brindle/platform/internal/FilePlace.h"

#include <zip.h>

#include <array>
#include <memory>

namespace brindle {

namespace {

using Archive = std::unique_ptr<zip_t, decltype(&zip_discard)>;
using ZipFile = std::unique_ptr<zip_file_t, decltype(&zip_fclose)>;

Archive Open(std::string_view bytes) {
    zip_error_t error;
    zip_error_init(&error);
    zip_source_t* source = zip_source_buffer_create(bytes.data(), bytes.size(), 0, &error);
    zip_t* archive = source == nullptr ? nullptr : zip_open_from_source(source, ZIP_RDONLY, &error);
    if (archive == nullptr && source != nullptr) zip_source_free(source);
    zip_error_fini(&error);
    return {archive, zip_discard};
}

// Reads one entry, never more than `limit` bytes; false when it is damaged or longer.
bool ReadEntry(zip_t* archive, zip_uint64_t index, std::uint64_t limit, std::string& contents) {
    const ZipFile file(zip_fopen_index(archive, index, 0), zip_fclose);
    if (!file) return false;
    std::array<char, 65536> buffer;
    for (;;) {
        const zip_int64_t count = zip_fread(file.get(), buffer.data(), buffer.size());
        if (count < 0) return false;
        if (count == 0) return true;
        if (contents.size() + static_cast<std::uint64_t>(count) > limit) return false;
        contents.append(buffer.data(), static_cast<std::size_t>(count));
    }
}

}  // namespace

std::optional<FileNode> UnpackZip(std::string_view bytes) {
    if (bytes.empty()) return std::nullopt;
    const Archive archive = Open(bytes);
    if (!archive) return std::nullopt;
    const zip_int64_t count = zip_get_num_entries(archive.get(), 0);
    if (count < 0 || count > kZipMaxEntries) return std::nullopt;
    FileNode root;
    root.mIsFolder = true;
    std::uint64_t room = kZipMaxUnpackedSize;
    for (zip_uint64_t index = 0; index < static_cast<zip_uint64_t>(count); ++index) {
        const char* name = zip_get_name(archive.get(), index, 0);
        if (name == nullptr) return std::nullopt;
        FileNode* place = PlaceFor(root, name);
        if (place == nullptr) return std::nullopt;
        const std::string_view path = name;
        if (path.empty() || path.back() == '/') continue;
        place->mContents.clear();
        if (!ReadEntry(archive.get(), index, room, place->mContents)) return std::nullopt;
        room -= place->mContents.size();
    }
    return root;
}

}  // namespace brindle
