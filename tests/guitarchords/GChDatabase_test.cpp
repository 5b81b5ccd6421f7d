// SPDX-License-Identifier: MIT
#include "tests/guitarchords/LibraryForms.h"
#include "tests/support/ScratchFolder.h"

#include "brindle/guitarchords/GChSimpleDatabase.h"
#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/FileTree.h"
#include "brindle/platform/Resources.h"

#include <doctest/doctest.h>

#include <cstdlib>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace fs = std::filesystem;

namespace {

constexpr GChShortTuning kDropped{50, 57, 62, 67, 71, 76};
constexpr GChShortTuning kGuitarAnOctaveUp{64, 69, 74, 79, 83, 88};

std::shared_ptr<GChLibrary> AddLibrary(GChDatabase& database, const GChShortTuning& shortTuning,
                                       const char* name, int chords = 1) {
    const auto library = database.tuningWithShortTuning(shortTuning, "")->createLibraryWithPath({});
    library->setLibraryName(name);
    for (int i = 0; i < chords; ++i) {
        const auto chord = std::make_shared<GChBasicChord>(library->gchTuning()->shortTuning());
        chord->addChordElem(nullptr, 1, i, 0);
        library->addBasicChord(chord);
    }
    return library;
}

std::vector<std::string> LibraryNames(const GChDatabase& database) {
    std::vector<std::string> names;
    for (const auto& library : database.allLibrariesForAnyTuning()) {
        names.push_back(library->libraryName());
    }
    return names;
}

std::vector<std::string> NamesInPackage(const std::string& path) {
    GChDatabase database;
    CHECK(database.readFromDbPackageAtPath(path));
    return LibraryNames(database);
}

using TNames = std::vector<std::string>;

}  // namespace

TEST_CASE("Tunings that lie an octave apart are one tuning of a database") {
    GChDatabase database;
    const auto guitar = database.tuningWithDefaultGuitarTuning();
    CHECK(guitar->tuningName() == "Default Guitar Tuning");
    CHECK(guitar->tuningPitchesString() == "E2 A2 D3 G3 B3 E4");
    CHECK(database.tuningWithShortTuning(kGuitarAnOctaveUp, "high") == guitar);
    CHECK(database.tuningWithShortTuning(kDropped, "dropped") != guitar);
    CHECK(database.tuningWithShortTuning({52, 57}, "two strings") == nullptr);
    CHECK(database.tunings().size() == 2);
    CHECK(database.tuningWithRuntimeID(guitar->runTimeID()) == guitar);
    CHECK_FALSE(guitar->isEqualToTuning(GChTuning(kGuitarAnOctaveUp)));
}

TEST_CASE("A change of the active tuning ends editing, a foreign tuning changes nothing") {
    GChDatabase database;
    const auto library = AddLibrary(database, kGChStandardGuitar, "a");
    const auto guitar = database.tunings()[0];
    const auto dropped = database.tuningWithShortTuning(kDropped, "");
    CHECK(database.setActiveTuning(guitar));
    CHECK_FALSE(database.editedChordHasChanges());
    database.setEditedChord(ViewOf(library->basicChords()[0]));
    CHECK(database.editedChordHasChanges());
    database.setOriginalChord(ViewOf(std::make_shared<GChBasicChord>(*library->basicChords()[0])));
    CHECK(database.sourceLibrary() == library);
    CHECK_FALSE(database.editedChordHasChanges());
    library->basicChords()[0]->setIsFavorite(true, 0);
    CHECK(database.editedChordHasChanges());
    CHECK_FALSE(database.basicChordWasChanged());

    CHECK_FALSE(database.setActiveTuning(std::make_shared<GChTuning>(kDropped)));
    CHECK_FALSE(database.setActiveTuning(nullptr));
    CHECK(database.setActiveTuning(guitar));
    CHECK(database.hasAdditionalChordToDisplay());
    CHECK(database.setActiveTuning(dropped));
    CHECK(database.editedChordIsEmpty());
    CHECK(database.originalBasicChord() == nullptr);
    CHECK(database.sourceLibrary() == nullptr);
}

TEST_CASE("The fingerings of the active tuning are listed by library") {
    GChDatabase database;
    const auto two = AddLibrary(database, kGChStandardGuitar, "two", 2);
    const auto three = AddLibrary(database, kGChStandardGuitar, "three", 3);
    const auto other = AddLibrary(database, kDropped, "other");
    const auto count = [&](const std::shared_ptr<GChLibrary>& library, bool asViews) {
        return std::visit([](const auto& chords) { return chords.size(); },
                          *database.allChordsFilteringLibrary(library, asViews));
    };
    CHECK(count(nullptr, true) == 0);
    database.setActiveTuning(two->gchTuning());
    CHECK(count(nullptr, false) == 5);
    CHECK(count(nullptr, true) == 5);
    CHECK(count(three, true) == 3);
    CHECK(count(other, true) == 0);
    CHECK(database.numberOfActiveChords() == 5);

    const auto replacement = std::make_shared<GChBasicChord>(kGChStandardGuitar);
    const auto replaced = two->basicChords()[0];
    database.replaceChord1Range1(replaced, replacement);
    CHECK(two->basicChords()[0] == replacement);
    CHECK(replaced->gchLibrary() == nullptr);
    database.deleteChord1Range(replaced);
    CHECK(count(two, true) == 2);
    database.deleteChord1Range(two->basicChords()[1]);
    CHECK(count(two, true) == 1);
}

TEST_CASE("Libraries that were taken out lose their files at the next save") {
    const CScratchFolder folder;
    const std::string path = folder.File("a.gchdb");
    REQUIRE(GChCreateDbPackageAtPath(path));
    GChDatabase database;
    database.setDefaultUserPackagePath(path);
    const auto a = AddLibrary(database, kGChStandardGuitar, "a");
    const auto b = AddLibrary(database, kGChStandardGuitar, "b");
    AddLibrary(database, kDropped, "c");
    CHECK(database.updateDatabaseFiles());
    CHECK(NamesInPackage(path).size() == 3);

    a->setLibraryName("new name of a");
    database.removeLibrary(b);
    database.removeTuning(database.tunings()[1]);
    CHECK(NamesInPackage(path).size() == 3);
    CHECK(database.updateDatabaseFiles());
    CHECK(database.filesToDelete().empty());
    CHECK(NamesInPackage(path) == TNames{"new name of a"});

    // A library whose file is gone is not written again.
    fs::remove(a->libraryPath());
    CHECK(database.updateDatabaseFiles());
    CHECK(NamesInPackage(path).empty());
}

TEST_CASE("Reading a package adds, a wrapper replaces, an import has no files") {
    const CScratchFolder folder;
    const std::string path = folder.File("a.gchdb");
    GChDatabase written;
    AddLibrary(written, kGChStandardGuitar, "a");
    AddLibrary(written, kDropped, "b")->setIsReadOnlyLibrary(true);
    CHECK(GChDatabase::writeLibraries(written.allUserLibrariesForAnyTuning(), path));
    CHECK(NamesInPackage(path) == TNames{"a"});
    CHECK(GChDatabase::writeLibraries(written.allLibrariesForAnyTuning(), path));

    GChDatabase database;
    CHECK(database.readFromDbPackageAtPath(path));
    CHECK(LibraryNames(database) == TNames{"a", "b"});
    CHECK(fs::is_regular_file(database.allLibrariesForAnyTuning()[0]->libraryPath()));
    CHECK(database.importFromDbPackagesAtPaths({path}));
    CHECK(LibraryNames(database) == TNames{"a", "a", "b", "b"});
    CHECK(database.allLibrariesForAnyTuning()[1]->libraryPath().empty());
    database.setActiveTuning(database.tunings()[0]);
    CHECK(database.readFromDbPackageWrapper(written.writeLibrariesToDbPackageWrapper(true), {}));
    CHECK(LibraryNames(database) == TNames{"a"});
    CHECK(database.activeTuning() == nullptr);
    CHECK(database.filesToDelete().empty());
    CHECK_FALSE(database.readFromDbPackageAtPath(folder.File("missing")));
    CHECK_FALSE(database.importFromDbPackagesAtPaths({folder.File("missing"), path}));
    CHECK(LibraryNames(database).size() == 3);
}

TEST_CASE("A package replaces nothing of value") {
    const CScratchFolder folder;
    const std::string deep = folder.File("Library/Chord Grids/a.gchdb/");
    CHECK(GChCreateDbPackageAtPath(deep));
    CHECK(GChCreateDbPackageAtPath(deep));
    const auto package = ReadFolder(deep);
    REQUIRE(package.has_value());
    CHECK(package->mChildren.size() == 1);
    const std::string& info = package->Child("GChInfo")->mContents;
    CHECK(info.find("<key>GChInfoVersion</key>\n\t<integer>100</integer>") != info.npos);

    GChDatabase database;
    const auto library = AddLibrary(database, kGChStandardGuitar, "a");
    CHECK(GChDatabase::writeLibraries({library}, deep));
    CHECK_FALSE(GChCreateDbPackageAtPath(deep));
    CHECK(GChDatabase::writeLibraries({library, library}, deep));
    CHECK(NamesInPackage(deep) == TNames{"a", "a"});

    const std::string file = folder.File("file");
    CHECK(WriteFileAtomically(file, "of value"));
    CHECK_FALSE(GChCreateDbPackageAtPath(file));
    CHECK_FALSE(GChDatabase::writeLibraries({library}, file));
    CHECK(WriteFileAtomically(deep + "letter.txt", "of value"));
    CHECK_FALSE(GChDatabase::writeLibraries({library}, deep));
    CHECK(ReadWholeFile(file) == "of value");
    CHECK(ReadWholeFile(deep + "letter.txt") == "of value");
}

TEST_CASE("The factory package and the user's are one database for showing") {
    const CScratchFolder folder;
    const std::string factory = folder.File("factory.gchdb");
    const std::string user = folder.File("home/user.gchdb");
    GChDatabase written;
    AddLibrary(written, kGChStandardGuitar, "factory");
    CHECK(GChDatabase::writeLibraries(written.allLibrariesForAnyTuning(), factory));

    CHECK(GChSimpleDatabase::makeWithFactoryDatabase(factory, "") == nullptr);
    auto database = GChSimpleDatabase::makeWithFactoryDatabase(factory, user);
    REQUIRE(database != nullptr);
    CHECK(database->defaultUserPackagePath() == user);
    AddLibrary(*database, kGChStandardGuitar, "own");
    CHECK(database->updateDatabaseFiles());
    database = GChSimpleDatabase::makeWithFactoryDatabase(factory, user);
    CHECK(LibraryNames(*database) == TNames{"own", "factory"});

    CHECK(std::get<0>(*database->allChordsFilteringLibrary(nullptr, false)).empty());
    database->setActiveTuning(database->tunings()[0]);
    const auto list = database->allChordsFilteringLibrary(nullptr, false);
    CHECK(std::get<0>(*list).size() == 2);
    std::get<0>(*list).clear();
    CHECK(database->allChordsFilteringLibrary(nullptr, true) == list);
    const auto own = database->allLibrariesForAnyTuning()[0];
    CHECK(std::get<0>(*database->allChordsFilteringLibrary(own, true)).size() == 1);
    CHECK(std::get<0>(*database->allChordsFilteringLibrary(nullptr, true)).size() == 2);

    const std::string file = own->libraryPath().string();
    CHECK(GChSimpleDatabase::makeWithLibraryFileAtPath(file, "")->tunings().size() == 1);
    CHECK(GChSimpleDatabase::makeWithLibraryFileAtPath(factory, "") == nullptr);
    CHECK(WriteFileAtomically(file, "no library"));
    CHECK(GChSimpleDatabase::makeWithLibraryFileAtPath(file, "") == nullptr);
}

TEST_CASE("The first start of a user makes the package in the home folder") {
    const CScratchFolder folder;
    const char* const oldHome = std::getenv("HOME");
    const std::string home = oldHome == nullptr ? "" : oldHome;
    setenv("HOME", folder.Path().c_str(), 1);
    SetResourceFolder(folder.File("no resources"));
    const GChDatabase database(true, "");
    CHECK(database.tunings().empty());
    CHECK(database.defaultUserPackagePath() ==
          folder.Path() + std::string(kGChUserPackagePath).substr(1));
    CHECK(fs::is_directory(database.defaultUserPackagePath()));
    SetResourceFolder({});
    setenv("HOME", home.c_str(), 1);
}

TEST_CASE("The edited chord, the one to go back to and the original are remembered apart") {
    GChDatabase database;
    const auto library = AddLibrary(database, kGChStandardGuitar, "a", 3);
    const auto& chords = library->basicChords();
    CHECK(database.editedBasicChord() == nullptr);
    database.setEditedChord(ViewOf(chords[0]));
    database.setUndoChord(ViewOf(chords[1]));
    database.setOriginalChord(ViewOf(chords[2]));
    REQUIRE((database.editedChord() && database.undoChord() && database.originalChord()));
    CHECK(database.editedBasicChord() == chords[0]);
    CHECK(database.undoChord()->basicChord() == chords[1]);
    CHECK(database.originalBasicChord() == chords[2]);
    CHECK_FALSE(database.chordNotInLibrary());
    database.setChordNotInLibrary(true);
    CHECK(database.chordNotInLibrary());
}
