// SPDX-License-Identifier: MIT
#include "cli/Language.h"

#include "cli/DataFolder.h"

#include "brindle/platform/Localization.h"

#include <clocale>
#include <filesystem>

namespace brindle::cli {
namespace {

namespace fs = std::filesystem;

// Where the catalogues lie: with the program, or else where they were installed.
fs::path CatalogueFolder() {
    const fs::path own = SharedFolderOfProgram("locale");
    return own.empty() ? fs::path(BRINDLE_LOCALE_FOLDER) : own;
}

}  // namespace

void UseLanguageOfUser() {
    std::setlocale(LC_MESSAGES, "");
    SetLocalizationFolder(CatalogueFolder().string());
}

}  // namespace brindle::cli
