// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <string>
#include <string_view>

namespace brindle {

/// A file or a folder in memory: a folder has children by name, a file has contents.
struct FileNode {
    bool mIsFolder = false;  ///< whether it may have children
    std::string mContents;   ///< the bytes of a file; empty for a folder
    std::map<std::string, FileNode, std::less<>> mChildren;  ///< of a folder, by name

    /// The child of that name, or null.
    [[nodiscard]] const FileNode* Child(std::string_view name) const {
        const auto it = mChildren.find(name);
        return it == mChildren.end() ? nullptr : &it->second;
    }
};

}  // namespace brindle
