// SPDX-License-Identifier: MIT
#include "cli/Language.h"

#include "brindle/platform/Localization.h"

#include <clocale>
#include <filesystem>

namespace brindle::cli {
namespace {

namespace fs = std::filesystem;

// Where the catalogues lie: beside the folder of the program, which may have been moved, or else
// where they were installed.
fs::path CatalogueFolder() {
    std::error_code error;
    const fs::path program = fs::read_symlink("/proc/self/exe", error);
    const fs::path beside = program.parent_path().parent_path() / "share" / "locale";
    const bool isThere = !error && fs::is_directory(beside, error);
    return isThere ? beside : fs::path(BRINDLE_LOCALE_FOLDER);
}

}  // namespace

void UseLanguageOfUser() {
    std::setlocale(LC_MESSAGES, "");
    SetLocalizationFolder(CatalogueFolder().string());
}

}  // namespace brindle::cli
