// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/guitarchords/internal/LibraryFile.h"
#include "brindle/platform/FileTree.h"
#include "brindle/platform/Localization.h"
#include "brindle/platform/PropertyList.h"

#include <nlohmann/json.hpp>

#include <fstream>

namespace brindle {

namespace fs = std::filesystem;

namespace {

constexpr const char* kInfoName = "GChInfo";
constexpr int kInfoVersion = 100;

// The factory library of earlier days is shown by the name that it has in the user's language.
constexpr std::string_view kOldFactoryLibraryName = "6-String Guitar Normal Tuning";
constexpr const char* kOldFactoryLibraryKey = "GChStr_6StrgsGuitarRegTuning";

FileNode EmptyPackage() {
    FileNode package;
    package.mIsFolder = true;
    FileNode& info = package.mChildren[kInfoName];
    info.mContents = PropertyListXml({{"GChInfoVersion", kInfoVersion}});
    return package;
}

/// A build without property lists writes no packages, rather than damaged ones.
bool CanBeWritten(const FileNode& package) {
    return !package.Child(kInfoName)->mContents.empty();
}

/// A library without content, as its tuning is gone, is left out.
FileNode PackageOf(const std::vector<std::shared_ptr<GChLibrary>>& libraries) {
    FileNode package = EmptyPackage();
    std::size_t number = 0;
    for (const auto& library : libraries) {
        std::string content = library->wholeLibraryFileContent();
        if (content.empty()) continue;
        // Readers take the files in the order of their names.
        std::string name = std::to_string(number++);
        name.insert(0, name.size() < 6 ? 6 - name.size() : 0, '0');
        package.mChildren["Library " + name].mContents = std::move(content);
    }
    return package;
}

bool IsLibrary(const FileNode& file) {
    using LibraryFile::kMagic;
    return !file.mIsFolder && file.mContents.compare(0, kMagic.size(), kMagic) == 0;
}

bool IsLibraryFile(const fs::directory_entry& entry) {
    using LibraryFile::kMagic;
    std::error_code error;
    if (!entry.is_regular_file(error)) return false;
    std::string begin(kMagic.size(), '\0');
    std::ifstream file(entry.path(), std::ios::binary);
    file.read(begin.data(), static_cast<std::streamsize>(begin.size()));
    return file && begin == kMagic;
}

std::size_t CountEntries(const fs::path& folder) {
    std::error_code error;
    std::size_t count = 0;
    for (fs::directory_iterator entries(folder, error); entries != fs::directory_iterator();
         entries.increment(error)) {
        ++count;
    }
    return count;
}

/// What stands at a path where a package is to be written.
enum class TDestination { Free, EmptyPackage, Package, Foreign };

TDestination PlaceAt(const fs::path& path) {
    std::error_code error;
    if (!fs::exists(fs::status(path, error))) return TDestination::Free;
    const auto folder = ReadFolder(path);
    if (!folder) return TDestination::Foreign;
    // Entries that cannot be read are not in the tree; they are of value, too.
    if (CountEntries(path) != folder->mChildren.size()) return TDestination::Foreign;
    bool isEmpty = true;
    for (const auto& [name, child] : folder->mChildren) {
        if (name == kInfoName && !child.mIsFolder) continue;
        if (!IsLibrary(child)) return TDestination::Foreign;
        isEmpty = false;
    }
    return isEmpty ? TDestination::EmptyPackage : TDestination::Package;
}

}  // namespace

void GChDatabase::setDefaultUserPackagePath(std::string_view path) {
    mDefaultUserPackagePath = ExpandTilde(path);
    std::error_code error;
    if (!fs::is_directory(mDefaultUserPackagePath, error)) mDefaultUserPackagePath.clear();
}

bool GChDatabase::readOneRegularFile(std::string_view bytes, const fs::path& libraryPath) {
    using LibraryFile::THeadFault;
    LibraryFile::CLibraryHead head;
    const THeadFault fault = LibraryFile::ReadHead(bytes, head);
    if (fault != THeadFault::None) return fault == THeadFault::NoTuningChunk;
    if (!mLocalizedDefaultTuningName.empty() && head.mTuningName == kGChDefaultTuningName) {
        head.mTuningName = mLocalizedDefaultTuningName;
    }
    const auto tuning = tuningWithShortTuning(head.mShortTuning, head.mTuningName);
    if (tuning == nullptr || !head.mLibraryName) return false;
    const auto library = tuning->createLibraryWithPath(libraryPath);
    const bool areChordsFine = library->readChordChunksFromBuffer(
        reinterpret_cast<const std::uint8_t*>(head.mChordChunks.data()), head.mChordChunks.size(),
        mChordCounter);
    library->setIsReadOnlyLibrary(head.mIsReadOnly);
    library->setLibraryName(*head.mLibraryName == kOldFactoryLibraryName
                                ? LocalizedString(kOldFactoryLibraryKey)
                                : *head.mLibraryName);
    return areChordsFine;
}

bool GChDatabase::readLibraryFromFileWrapper(const FileNode& package, const fs::path& packagePath) {
    for (const auto& [name, entry] : package.mChildren) {
        if (entry.mIsFolder || name == kInfoName) continue;
        readOneRegularFile(entry.mContents, packagePath.empty() ? fs::path() : packagePath / name);
    }
    return true;
}

bool GChDatabase::readFromDbPackageAtPath(std::string_view path) {
    const fs::path packagePath = ExpandTilde(path);
    const auto package = ReadFolder(packagePath);
    return package && readLibraryFromFileWrapper(*package, packagePath);
}

bool GChDatabase::readFromDbPackageWrapper(const FileNode& package, const fs::path& packagePath) {
    mTunings.clear();
    mActiveTuning = nullptr;
    _EndEditing();
    return readLibraryFromFileWrapper(package, packagePath);
}

bool GChDatabase::importFromDbPackagesAtPaths(const std::vector<std::string>& paths) {
    bool areAllThere = true;
    for (const std::string& path : paths) {
        const auto package = ReadFolder(ExpandTilde(path));
        areAllThere = package && readLibraryFromFileWrapper(*package, {}) && areAllThere;
    }
    return areAllThere;
}

FileNode GChDatabase::writeLibrariesToDbPackageWrapper(bool onlyUserLibraries) const {
    return PackageOf(onlyUserLibraries ? allUserLibrariesForAnyTuning()
                                       : allLibrariesForAnyTuning());
}

bool GChDatabase::writeLibraries(const std::vector<std::shared_ptr<GChLibrary>>& libraries,
                                 std::string_view toNewDbPackagePath) {
    const fs::path path = ExpandTilde(toNewDbPackagePath);
    const FileNode package = PackageOf(libraries);
    return CanBeWritten(package) && PlaceAt(path) != TDestination::Foreign &&
           WriteFolderAtomically(path, package);
}

bool GChDatabase::updateDatabaseFiles() {
    bool areAllSaved = true;
    for (const auto& library : allLibrariesForAnyTuning()) {
        areAllSaved = library->updateLibraryFile(mDefaultUserPackagePath) && areAllSaved;
    }
    for (const fs::path& file : mFilesToDelete) {
        std::error_code ignored;
        fs::remove(file, ignored);
    }
    mFilesToDelete.clear();
    return areAllSaved;
}

bool GChCreateDbPackageAtPath(std::string_view path) {
    const fs::path packagePath = ExpandTilde(path);
    const TDestination place = PlaceAt(packagePath);
    if (place != TDestination::Free && place != TDestination::EmptyPackage) return false;
    const FileNode package = EmptyPackage();
    if (!CanBeWritten(package)) return false;
    std::error_code ignored;
    fs::create_directories(packagePath.parent_path(), ignored);
    return WriteFolderAtomically(packagePath, package);
}

bool GChIsDbPackageAtPath(std::string_view path) {
    const fs::path package = ExpandTilde(path);
    std::error_code error;
    if (fs::is_regular_file(package / kInfoName, error)) return true;
    for (fs::directory_iterator entries(package, error); entries != fs::directory_iterator();
         entries.increment(error)) {
        if (IsLibraryFile(*entries)) return true;
    }
    return false;
}

}  // namespace brindle
