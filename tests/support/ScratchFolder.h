// SPDX-License-Identifier: MIT
#pragma once

#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <string>
#include <string_view>

namespace brindle::test {

/// A folder of this process alone, removed at its end.
class CScratchFolder {
public:
    CScratchFolder() {
        std::string name =
            (std::filesystem::temp_directory_path() / "brindle-test-XXXXXX").string();
        if (mkdtemp(name.data()) == nullptr) std::abort();
        mPath = name;
    }
    CScratchFolder(const CScratchFolder&) = delete;
    CScratchFolder& operator=(const CScratchFolder&) = delete;
    ~CScratchFolder() {
        std::error_code ignored;
        std::filesystem::remove_all(mPath, ignored);
    }

    [[nodiscard]] std::string Path() const { return mPath.string(); }
    [[nodiscard]] std::string File(std::string_view name) const { return (mPath / name).string(); }

private:
    std::filesystem::path mPath;
};

}  // namespace brindle::test
