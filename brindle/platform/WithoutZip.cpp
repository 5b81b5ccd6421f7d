// SPDX-License-Identifier: MIT
// In place of ZipContainer.cpp in a library that reads no scores (BRINDLE_SCORES=OFF).
#include "brindle/platform/ZipContainer.h"

namespace brindle {

std::optional<FileNode> UnpackZip(std::string_view) {
    return std::nullopt;
}

}  // namespace brindle
