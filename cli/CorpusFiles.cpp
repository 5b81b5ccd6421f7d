// SPDX-License-Identifier: MIT
#include "cli/CorpusFiles.h"

#include "brindle/platform/Ascii.h"

#include <sys/stat.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstring>
#include <filesystem>

namespace brindle::cli {
namespace {

namespace fs = std::filesystem;

constexpr auto kSongEndings = std::to_array<std::string_view>(
    {"txt",   "xml", "musicxml", "mxl",  "cho",   "chopro", "chordpro", "crd",
     "chord", "pro", "htm",      "html", "rntxt", "zip",    "tar",      "tgz",
     "tbz2",  "txz", "gz",       "bz2",  "xz",    "zst"});

std::string_view NameInPath(std::string_view path) {
    return path.substr(path.rfind('/') + 1);
}

std::string JoinedPath(const std::string& folder, const std::string& name) {
    if (folder.empty()) return name;
    return folder.back() == '/' ? folder + name : folder + '/' + name;
}

/// The names in a folder by their bytes; `error` tells why there are none.
std::vector<std::string> SortedNames(const std::string& folder, std::error_code& error) {
    std::vector<std::string> names;
    for (fs::directory_iterator entry(folder, error), end; !error && entry != end;
         entry.increment(error)) {
        names.push_back(entry->path().filename().string());
    }
    std::sort(names.begin(), names.end());
    return names;
}

}  // namespace

bool IsHiddenName(std::string_view path) {
    while (!path.empty()) {
        const std::string_view name = path.substr(0, path.find('/'));
        const bool isWay = name == "." || name == "..";
        // What one system puts into archives beside each file.
        if ((name.starts_with('.') && !isWay) || name == "__MACOSX") return true;
        path.remove_prefix(std::min(name.size() + 1, path.size()));
    }
    return false;
}

bool HasNameOfSongs(std::string_view path) {
    const std::string_view name = NameInPath(path);
    const std::size_t dot = name.rfind('.');
    if (dot == name.npos || IsHiddenName(path)) return false;
    std::string ending(name.substr(dot + 1));
    std::transform(ending.begin(), ending.end(), ending.begin(), Ascii::ToLower);
    return std::find(kSongEndings.begin(), kSongEndings.end(), ending) != kSongEndings.end();
}

CCorpusFiles::CCorpusFiles(std::vector<std::string> paths, bool takesAll) : mTakesAll(takesAll) {
    mLevels.push_back({{}, std::move(paths)});
}

std::optional<CCorpusFile> CCorpusFiles::Next() {
    while (!mLevels.empty()) {
        CLevel& level = mLevels.back();
        if (level.mNext == level.mNames.size()) {
            mLevels.pop_back();
            continue;
        }
        const bool isNamed = mLevels.size() == 1;
        auto file = Visit(JoinedPath(level.mFolder, level.mNames[level.mNext++]), isNamed);
        if (file) return file;
    }
    return std::nullopt;
}

std::optional<CCorpusFile> CCorpusFiles::Visit(std::string path, bool isNamed) {
    if (isNamed && path == "-") return CCorpusFile{path, {}};
    if (!isNamed && IsHiddenName(NameInPath(path))) return std::nullopt;
    struct stat status {};
    if (stat(path.c_str(), &status) != 0) {
        if (!isNamed && !mTakesAll && !HasNameOfSongs(NameInPath(path))) return std::nullopt;
        return CCorpusFile{path, errno == ENOENT ? "there is no such file" : std::strerror(errno)};
    }
    if (S_ISDIR(status.st_mode)) {
        const bool isNew = mWalked.insert({status.st_dev, status.st_ino}).second;
        return isNew ? OpenFolder(std::move(path)) : std::nullopt;
    }
    // A pipe in a folder would be waited for without end.
    if (isNamed || (S_ISREG(status.st_mode) && (mTakesAll || HasNameOfSongs(NameInPath(path))))) {
        return CCorpusFile{std::move(path), {}};
    }
    ++mPassedOver;
    return std::nullopt;
}

std::optional<CCorpusFile> CCorpusFiles::OpenFolder(std::string path) {
    std::error_code error;
    std::vector<std::string> names = SortedNames(path, error);
    if (error) return CCorpusFile{path, "the folder cannot be read: " + error.message()};
    mLevels.push_back({std::move(path), std::move(names)});
    return std::nullopt;
}

}  // namespace brindle::cli
