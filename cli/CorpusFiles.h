// SPDX-License-Identifier: MIT
#pragma once

#include <sys/types.h>

#include <cstddef>
#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace brindle::cli {

/// Whether a file or a member of an archive looks by its name as if songs were in it: known
/// endings, and no hidden file or folder on the way.
[[nodiscard]] bool HasNameOfSongs(std::string_view path);
/// The same by the folders on the way and by the name, whatever its ending.
[[nodiscard]] bool IsHiddenName(std::string_view path);

/// A file to be read, or a folder that cannot be.
struct CCorpusFile {
    std::string mPath;
    /// Why it is none; empty if it is one.
    std::string mFault;
};

/// Walks files and folders: named ones in the order of their names on the command line, what is in
/// a folder in the order of the bytes of its names. Links are followed; a folder is walked once,
/// however many ways lead to it. In memory are the names of the folders on the way.
class CCorpusFiles {
public:
    /// With `takesAll`, files of a folder are taken whatever their endings.
    CCorpusFiles(std::vector<std::string> paths, bool takesAll);

    /// The next file; nothing at the end.
    [[nodiscard]] std::optional<CCorpusFile> Next();

    /// Files that were left out, since their names are not those of songs.
    [[nodiscard]] std::size_t PassedOver() const { return mPassedOver; }

private:
    /// A folder with its names; the topmost has no path and those that were told.
    struct CLevel {
        std::string mFolder;
        std::vector<std::string> mNames;
        std::size_t mNext = 0;
    };

    [[nodiscard]] std::optional<CCorpusFile> Visit(std::string path, bool isNamed);
    [[nodiscard]] std::optional<CCorpusFile> OpenFolder(std::string path);

    std::vector<CLevel> mLevels;
    std::set<std::pair<dev_t, ino_t>> mWalked;
    std::size_t mPassedOver = 0;
    bool mTakesAll;
};

}  // namespace brindle::cli
