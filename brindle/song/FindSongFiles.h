// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

namespace brindle {

/// A file that was named or that stands in a folder that was.
struct CFoundFile {
    std::string mPath;      ///< below the folder that was named
    bool mIsNamed = false;  ///< itself, and not a folder around it
};

/// The files themselves, be they there or not, and those in the folders and below them, in
/// alphabetic order, whose names end in .xml, .musicxml, .mxl or .txt. What cannot be looked into
/// is stepped over.
[[nodiscard]] std::vector<CFoundFile> FindSongFiles(const std::vector<std::string>& paths);

}  // namespace brindle
