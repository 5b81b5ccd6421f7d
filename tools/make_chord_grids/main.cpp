// SPDX-License-Identifier: MIT
// Makes the factory package of chord grids, "data/Chord Grids/GuitarChords.gchdb", of the text
// data/chord-grids.txt; with --check only tells whether the package is as it would be made.

#include "tools/make_chord_grids/ChordGridText.h"

#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/platform/AtomicFile.h"

#include <fmt/format.h>

#include <cstdio>
#include <filesystem>
#include <string>
#include <vector>

using namespace brindle;

namespace {

const std::string kData = BRINDLE_SOURCE_DIR "/data/";

int Fail(const std::string& message) {
    fmt::print(stderr, "make_chord_grids: {}\n", message);
    return 1;
}

/// The bytes of the library files.
std::vector<std::string> ContentOf(const GChDatabase& database) {
    std::vector<std::string> files;
    for (const auto& library : database.allLibrariesForAnyTuning()) {
        files.push_back(library->wholeLibraryFileContent());
    }
    return files;
}

}  // namespace

int main(int argc, char** argv) {
    const bool isCheck = argc == 2 && std::string(argv[1]) == "--check";
    if (argc > 1 && !isCheck) return Fail("usage: make_chord_grids [--check]");
    const auto text = ReadWholeFile(kData + "chord-grids.txt");
    if (!text) return Fail("data/chord-grids.txt cannot be read");
    std::string fault;
    const auto tuning = tools::ReadChordGrids(*text, fault);
    if (tuning == nullptr) return Fail("data/chord-grids.txt, " + fault);

    const std::string path = kData + std::string(kGChFactoryPackagePath);
    if (!isCheck) {
        std::error_code ignored;
        std::filesystem::create_directories(std::filesystem::path(path).parent_path(), ignored);
        const bool isWritten = GChDatabase::writeLibraries(tuning->tuningLibraries(), path);
        return isWritten ? 0 : Fail(path + " cannot be written");
    }
    GChDatabase package;
    GChDatabase made;
    for (const auto& library : tuning->tuningLibraries()) {
        made.readOneRegularFile(library->wholeLibraryFileContent(), {});
    }
    const bool isSame =
        package.readFromDbPackageAtPath(path) && ContentOf(package) == ContentOf(made);
    return isSame ? 0
                  : Fail("the package is not made of data/chord-grids.txt; run make_chord_grids");
}
