// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChSimpleDatabase.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/FileTree.h"

#include <algorithm>

namespace brindle {

std::unique_ptr<GChSimpleDatabase> GChSimpleDatabase::makeWithFactoryDatabase(
    std::string_view factoryPath, std::string_view userPath) {
    if (factoryPath.empty() || userPath.empty()) return nullptr;
    std::unique_ptr<GChSimpleDatabase> database(new GChSimpleDatabase);
    if (!database->readFromDbPackageAtPath(userPath) && GChCreateDbPackageAtPath(userPath)) {
        database->readFromDbPackageAtPath(userPath);
    }
    database->readFromDbPackageAtPath(factoryPath);
    database->setDefaultUserPackagePath(userPath);
    return database;
}

std::unique_ptr<GChSimpleDatabase> GChSimpleDatabase::makeWithLibraryFileAtPath(
    std::string_view path, std::string_view defaultTuningName) {
    std::unique_ptr<GChSimpleDatabase> database(new GChSimpleDatabase);
    database->setLocalizedDefaultTuningName(defaultTuningName);
    const std::filesystem::path file = ExpandTilde(path);
    const auto bytes = ReadWholeFile(file, kFolderMaxSize);
    if (!bytes || !database->readOneRegularFile(*bytes, file)) return nullptr;
    return database;
}

std::shared_ptr<GChChordList> GChSimpleDatabase::allChordsFilteringLibrary(
    const std::shared_ptr<GChLibrary>& library, bool /*createRanges*/) {
    const auto none = [] { return std::make_shared<GChChordList>(std::vector<GChChord>()); };
    if (activeTuning() == nullptr) return none();
    const auto& libraries = activeTuning()->tuningLibraries();
    if (library != nullptr &&
        std::find(libraries.begin(), libraries.end(), library) == libraries.end()) {
        return none();
    }
    if (mFilteredChords == nullptr || mLastFilter != library) {
        mLastFilter = library;
        mFilteredChords = GChDatabase::allChordsFilteringLibrary(library, true);
    }
    return mFilteredChords;
}

}  // namespace brindle
