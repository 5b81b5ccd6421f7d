// SPDX-License-Identifier: MIT
#include "cli/DataFolder.h"

#include "brindle/platform/Resources.h"

namespace brindle::cli {

namespace fs = std::filesystem;

fs::path SharedFolderOfProgram(const char* name) {
    std::error_code error;
    const fs::path program = fs::read_symlink("/proc/self/exe", error);
    const fs::path beside = program.parent_path().parent_path() / "share" / name;
    return !error && fs::is_directory(beside, error) ? beside : fs::path();
}

void UseDataOfProgram() {
    SetResourceFolder(SharedFolderOfProgram("brindle"));
}

}  // namespace brindle::cli
