// SPDX-License-Identifier: MIT
#include "brindle/song/FindSongFiles.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <filesystem>
#include <string_view>
#include <system_error>

namespace brindle {
namespace {

namespace fs = std::filesystem;

bool HasSongEnding(const fs::path& path) {
    constexpr auto endings = std::to_array<std::string_view>({".xml", ".musicxml", ".mxl", ".txt"});
    return std::find(endings.begin(), endings.end(), path.extension().string()) != endings.end();
}

void AddFolder(const std::string& folder, std::vector<CFoundFile>& files) {
    const std::size_t before = files.size();
    std::error_code error;
    const auto skip = fs::directory_options::skip_permission_denied;
    for (fs::recursive_directory_iterator entry(folder, skip, error), end; entry != end;
         entry.increment(error)) {
        if (entry->is_regular_file(error) && HasSongEnding(entry->path())) {
            files.push_back({entry->path().string(), false});
        }
    }
    std::sort(files.begin() + static_cast<std::ptrdiff_t>(before), files.end(),
              [](const CFoundFile& a, const CFoundFile& b) { return a.mPath < b.mPath; });
}

}  // namespace

std::vector<CFoundFile> FindSongFiles(const std::vector<std::string>& paths) {
    std::vector<CFoundFile> files;
    for (const std::string& path : paths) {
        std::error_code error;
        if (fs::is_directory(path, error)) {
            AddFolder(path, files);
        } else {
            files.push_back({path, true});
        }
    }
    return files;
}

}  // namespace brindle
