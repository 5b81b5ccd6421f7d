// SPDX-License-Identifier: MIT
#pragma once

#include <archive.h>
#include <archive_entry.h>

#include <cstdlib>
#include <string>
#include <utility>
#include <vector>

namespace brindle::test {

using TMembers = std::vector<std::pair<std::string, std::string>>;

/// An archive with these names and contents: "zip", or "tar" with "gz", "bz2", "xz", "zst" or
/// nothing behind a point.
inline std::string PackedArchive(const std::string& kind, const TMembers& members) {
    std::size_t room = 1 << 20;
    for (const auto& [name, text] : members) room += name.size() + text.size() + 4096;
    std::string bytes(room, '\0');
    std::size_t used = 0;
    archive* const packed = archive_write_new();
    kind == "zip" ? archive_write_set_format_zip(packed) : archive_write_set_format_ustar(packed);
    if (kind == "tar.gz") archive_write_add_filter_gzip(packed);
    if (kind == "tar.bz2") archive_write_add_filter_bzip2(packed);
    if (kind == "tar.xz") archive_write_add_filter_xz(packed);
    if (kind == "tar.zst") archive_write_add_filter_zstd(packed);
    if (archive_write_open_memory(packed, bytes.data(), room, &used) != ARCHIVE_OK) std::abort();
    for (const auto& [name, text] : members) {
        archive_entry* const entry = archive_entry_new();
        archive_entry_set_pathname(entry, name.c_str());
        archive_entry_set_filetype(entry, AE_IFREG);
        archive_entry_set_perm(entry, 0644);
        archive_entry_set_size(entry, static_cast<la_int64_t>(text.size()));
        if (archive_write_header(packed, entry) != ARCHIVE_OK) std::abort();
        archive_write_data(packed, text.data(), text.size());
        archive_entry_free(entry);
    }
    archive_write_close(packed);
    archive_write_free(packed);
    bytes.resize(used);
    return bytes;
}

}  // namespace brindle::test
