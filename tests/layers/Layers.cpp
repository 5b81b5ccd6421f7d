// SPDX-License-Identifier: MIT
#include "Layers.h"

#include <algorithm>
#include <array>
#include <sstream>

namespace brindle::test {
namespace {

// The folders from the ground up. An arrow may point to the same folder or to one further up in
// this list of names, never further down in it.
constexpr auto kFolders = std::to_array<std::string_view>({
    "platform",
    "theory",
    "chords",
    "neural",
    "analysis",
    "markov",
    "guitarchords",
    "musicxml",
    "song",
    "present",
    "c",
});
constexpr std::size_t kProgram = kFolders.size();
constexpr std::size_t kNowhere = kProgram + 1;

// What only the adapters may name.
constexpr auto kPlatformLibraries = std::to_array<std::string_view>({
    "libxml/",
    "zip.h",
    "plist/",
    "libintl.h",
    "unistd.h",
    "fcntl.h",
    "sys/",
});
// What a public header may not name: the heavy half of the JSON library, libraries of the sources
// only, and what the oldest compiler lacks.
constexpr auto kNotInHeaders = std::to_array<std::string_view>({
    "nlohmann/json.hpp",
    "fmt/",
    "CLI/",
    "doctest/",
    "format",
    "ranges",
    "source_location",
});

// The one file that names the library for command lines, whose header is long to compile.
constexpr std::string_view kCommandLine = "cli/CCommand.cpp";
constexpr auto kCommandLineLibrary = std::to_array<std::string_view>({"CLI/"});

std::string_view FolderOf(std::string_view path) {
    constexpr std::string_view library = "brindle/";
    if (path.substr(0, library.size()) != library) return {};
    path.remove_prefix(library.size());
    const auto slash = path.find('/');
    return slash == path.npos ? std::string_view{} : path.substr(0, slash);
}

// The floor of a file; the two headers that stand in no folder are the version, on the ground, and
// the umbrella, above all folders.
std::size_t FloorOf(std::string_view path) {
    if (path == "brindle/Version.h") return 0;
    if (path == "brindle/brindle.h" || path.substr(0, 4) == "cli/") return kProgram;
    const auto* const found = std::find(kFolders.begin(), kFolders.end(), FolderOf(path));
    if (found == kFolders.end()) return kNowhere;
    return static_cast<std::size_t>(found - kFolders.begin());
}

bool IsHeader(std::string_view path) {
    return path.size() > 2 && path.substr(path.size() - 2) == ".h";
}

// Headers that are not installed.
bool IsInternal(std::string_view path) {
    return path.find("/internal/") != path.npos;
}

// True for a name that is in the list or begins with an entry that names a folder ("sys/").
template <class List>
bool IsListed(const List& list, std::string_view name) {
    return std::any_of(list.begin(), list.end(), [&](std::string_view entry) {
        return entry.back() == '/' ? name.substr(0, entry.size()) == entry : name == entry;
    });
}

// The name between the quotes or brackets of an #include line; empty for any other line.
std::string IncludedName(const std::string& line) {
    const auto first = line.find_first_not_of(" \t");
    if (first == line.npos || line[first] != '#') return {};
    const auto word = line.find_first_not_of(" \t", first + 1);
    if (word == line.npos || line.compare(word, 7, "include") != 0) return {};
    const auto open = line.find_first_of("\"<", word);
    if (open == line.npos) return {};
    const auto close = line.find_first_of("\">", open + 1);
    return close == line.npos ? std::string{} : line.substr(open + 1, close - open - 1);
}

std::vector<std::string> Includes(std::string_view text) {
    std::vector<std::string> names;
    std::istringstream lines{std::string(text)};
    for (std::string line; std::getline(lines, line);) {
        auto name = IncludedName(line);
        if (!name.empty()) names.push_back(std::move(name));
    }
    return names;
}

bool IsOurs(std::string_view name) {
    return name.substr(0, 8) == "brindle/" || name.substr(0, 4) == "cli/";
}

}  // namespace

std::string FirstInclude(std::string_view text) {
    const auto names = Includes(text);
    return names.empty() ? std::string{} : names.front();
}

std::vector<std::string> IncludeFaults(std::string_view path, std::string_view text) {
    std::vector<std::string> faults;
    const auto report = [&](const std::string& name, std::string_view what) {
        faults.push_back(std::string(path) + ": " + name + ": " + std::string(what));
    };
    if (FloorOf(path) == kNowhere) report("", "stands on no floor of the house");
    const bool isLibrary = FloorOf(path) < kProgram;
    const bool isPublicHeader = isLibrary && IsHeader(path) && !IsInternal(path);
    for (const auto& name : Includes(text)) {
        if (IsOurs(name)) {
            if (FloorOf(name) == kNowhere) report(name, "no floor of the house");
            if (FloorOf(name) > FloorOf(path)) report(name, "an arrow that points up");
            if (FolderOf(path) == "platform" && FolderOf(name) != "platform") {
                report(name, "no music in the adapters");
            }
        } else {
            if (isLibrary && FolderOf(path) != "platform" && IsListed(kPlatformLibraries, name)) {
                report(name, "only the adapters name it");
            }
            if (isPublicHeader && IsListed(kNotInHeaders, name)) report(name, "not in a header");
            if (path != kCommandLine && IsListed(kCommandLineLibrary, name)) {
                report(name, "only cli/CCommand.cpp names it");
            }
        }
    }
    return faults;
}

}  // namespace brindle::test
