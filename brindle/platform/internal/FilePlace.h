// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/platform/FileNode.h"

#include <string>
#include <string_view>

// Internal to platform/ and to what stands in for its adapters.
namespace brindle {

/// The place of "a/b/c" in the tree, its folders made; null for a path that is too deep.
inline FileNode* PlaceFor(FileNode& root, std::string_view path) {
    // Deep enough for any real container, shallow enough to unwind.
    constexpr int kMaxDepth = 64;
    FileNode* node = &root;
    for (int depth = 0; depth < kMaxDepth; ++depth) {
        const std::size_t slash = path.find('/');
        node->mIsFolder = true;
        if (slash == 0) {
            path.remove_prefix(1);
            continue;
        }
        if (path.empty()) return node;
        node = &node->mChildren[std::string(path.substr(0, slash))];
        if (slash == std::string_view::npos) return node;
        path.remove_prefix(slash + 1);
    }
    return nullptr;
}

}  // namespace brindle
