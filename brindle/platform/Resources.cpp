// SPDX-License-Identifier: MIT
#include "brindle/platform/Resources.h"

namespace brindle {

namespace {

std::filesystem::path& FolderOfHost() {
    static std::filesystem::path folder;
    return folder;
}

}  // namespace

std::filesystem::path ResourceFolder() {
    return FolderOfHost().empty() ? std::filesystem::path(BRINDLE_DATA_DIR) : FolderOfHost();
}

void SetResourceFolder(const std::filesystem::path& folder) {
    FolderOfHost() = folder;
}

}  // namespace brindle
