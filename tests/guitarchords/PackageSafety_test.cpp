// SPDX-License-Identifier: MIT
// Whatever happens to a writer, a reader finds the package as it was before or as it was to be. The
// writer is a child process: it is killed at each of its calls of the system, its writes fail after
// each number of bytes, and its opens fail.
#include "tests/guitarchords/LibraryForms.h"
#include "tests/support/ScratchFolder.h"

#include "brindle/platform/FileTree.h"

#include <doctest/doctest.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <functional>

#if defined(__linux__)
#include <sys/ptrace.h>
#endif

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace fs = std::filesystem;

namespace {

/// A package with two libraries of a few chords.
class CPackage {
public:
    explicit CPackage(int highestFret) {
        for (const char* name : {"first", "second"}) {
            const auto library = mTuning->createLibraryWithPath({});
            library->setLibraryName(name + std::to_string(highestFret));
            for (int fret = 0; fret <= highestFret; ++fret) {
                const auto chord = std::make_shared<GChBasicChord>(kGChStandardGuitar);
                chord->addChordElem(nullptr, 1, fret, 0);
                library->addBasicChord(chord);
            }
        }
    }

    [[nodiscard]] bool Write(const std::string& path) const {
        return GChDatabase::writeLibraries(mTuning->tuningLibraries(), path);
    }

private:
    std::shared_ptr<GChTuning> mTuning = std::make_shared<GChTuning>(kGChStandardGuitar);
};

json ContentOf(const std::string& path) {
    GChDatabase database;
    if (!database.readFromDbPackageAtPath(path)) return nullptr;
    return FormOf(database);
}

// What saving does: reads the package, changes all names, writes the files.
bool SaveWithOtherNames(const std::string& path) {
    GChDatabase database;
    database.readFromDbPackageAtPath(path);
    for (const auto& library : database.allLibrariesForAnyTuning()) {
        library->setLibraryName(library->libraryName() + " saved");
    }
    return database.updateDatabaseFiles();
}

/// Runs work in a child and gives whether it succeeded.
bool RunInChild(const std::function<bool()>& work) {
    const pid_t child = fork();
    if (child == 0) _exit(work() ? 0 : 1);
    int status = 0;
    waitpid(child, &status, 0);
    return WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

void Limit(decltype(RLIMIT_FSIZE) resource, rlim_t most) {
    const rlimit limit{most, most};
    setrlimit(resource, &limit);
}

enum class TOutcome { Killed, Finished, CannotTrace };

/// Kills a child when it stops for the time number `step`, before or behind a call of the system.
TOutcome RunKilledAtCall([[maybe_unused]] int step,
                         [[maybe_unused]] const std::function<bool()>& work) {
#if defined(__linux__)
    const pid_t child = fork();
    if (child == 0) {
        if (ptrace(PTRACE_TRACEME, 0, nullptr, nullptr) != 0) _exit(2);
        raise(SIGSTOP);
        _exit(work() ? 0 : 1);
    }
    int status = 0;
    waitpid(child, &status, 0);
    if (WIFEXITED(status)) return TOutcome::CannotTrace;
    for (int i = 0; i < step; ++i) {
        ptrace(PTRACE_SYSCALL, child, nullptr, nullptr);
        waitpid(child, &status, 0);
        if (WIFEXITED(status)) return TOutcome::Finished;
    }
    kill(child, SIGKILL);
    waitpid(child, &status, 0);
    return TOutcome::Killed;
#else
    return TOutcome::CannotTrace;
#endif
}

}  // namespace

TEST_CASE("A package that is replaced is the old one or the new one, whenever the writer dies") {
    const CPackage oldPackage(2);
    const CPackage newPackage(5);
    const CScratchFolder folder;
    const std::string path = folder.File("a.gchdb");
    REQUIRE(newPackage.Write(path));
    const json newContent = ContentOf(path);
    REQUIRE(oldPackage.Write(path));
    const json oldContent = ContentOf(path);
    REQUIRE(oldContent != newContent);

    // Each call stops twice, when it begins and when it ends.
    int step = -1;
    int oldOnes = 0;
    int newOnes = 0;
    auto outcome = TOutcome::Killed;
    while (outcome == TOutcome::Killed) {
        outcome = RunKilledAtCall(step += 2, [&] { return newPackage.Write(path); });
        const json content = ContentOf(path);
        INFO("call " << step);
        REQUIRE((content == oldContent || content == newContent));
        ++(content == oldContent ? oldOnes : newOnes);
        // What the dead have left beside.
        fs::remove_all(folder.Path());
        fs::create_directory(folder.Path());
        REQUIRE(oldPackage.Write(path));
    }
    if (outcome == TOutcome::CannotTrace) {
        MESSAGE("this system lets no process be traced: nothing was killed");
        return;
    }
    CHECK(oldOnes > 10);
    CHECK(newOnes > 1);
}

TEST_CASE("A library that is saved is the old one or the new one, whenever the writer dies") {
    const CPackage oldPackage(2);
    const CScratchFolder folder;
    const std::string path = folder.File("a.gchdb");
    REQUIRE(oldPackage.Write(path));
    auto outcome = TOutcome::Killed;
    for (int step = 1; outcome == TOutcome::Killed; step += 2) {
        outcome = RunKilledAtCall(step, [&] { return SaveWithOtherNames(path); });
        INFO("call " << step);
        GChDatabase database;
        REQUIRE(database.readFromDbPackageAtPath(path));
        const auto libraries = database.allLibrariesForAnyTuning();
        REQUIRE(libraries.size() == 2);
        for (const auto& library : libraries) {
            CHECK(library->numberOfChords() == 3);
            const std::string& name = library->libraryName();
            const bool isWhole = name == "first2" || name == "second2" || name == "first2 saved" ||
                                 name == "second2 saved";
            CHECK(isWhole);
        }
        // What the dead have left beside, which the next writer would look at.
        fs::remove_all(folder.Path());
        fs::create_directory(folder.Path());
        REQUIRE(oldPackage.Write(path));
    }
}

TEST_CASE("A writer that cannot write leaves the old package and nothing beside") {
    const CPackage oldPackage(2);
    const CPackage newPackage(5);
    const CScratchFolder folder;
    const std::string path = folder.File("a.gchdb");
    REQUIRE(oldPackage.Write(path));
    const json oldContent = ContentOf(path);
    const auto check = [&] {
        REQUIRE(ContentOf(path) == oldContent);
        REQUIRE(std::distance(fs::directory_iterator(folder.Path()), {}) == 1);
    };
    // A library of it has 175 bytes.
    for (rlim_t bytes = 0; bytes < 170; bytes += 7) {
        const auto write = [&] {
            std::signal(SIGXFSZ, SIG_IGN);
            Limit(RLIMIT_FSIZE, bytes);
            return newPackage.Write(path);
        };
        INFO("limit of " << bytes << " bytes");
        REQUIRE_FALSE(RunInChild(write));
        check();
        const auto save = [&] {
            std::signal(SIGXFSZ, SIG_IGN);
            Limit(RLIMIT_FSIZE, std::min<rlim_t>(bytes, 90));
            return SaveWithOtherNames(path);
        };
        REQUIRE_FALSE(RunInChild(save));
        check();
    }
    for (rlim_t files = 0; files < 4; ++files) {
        const auto write = [&] {
            Limit(RLIMIT_NOFILE, files);
            return newPackage.Write(path);
        };
        REQUIRE_FALSE(RunInChild(write));
        check();
    }
    REQUIRE(RunInChild([&] { return newPackage.Write(path); }));
}

TEST_CASE("A tree with names that no file can have is not written") {
    const CScratchFolder folder;
    for (const char* name : {"..", ".", "", "a/b"}) {
        FileNode tree;
        tree.mIsFolder = true;
        tree.mChildren[name].mContents = "x";
        CHECK_FALSE(WriteFolderAtomically(folder.File("tree"), tree));
    }
    CHECK(fs::is_empty(folder.Path()));
    CHECK_FALSE(WriteFolderAtomically(folder.File("tree"), FileNode()));
}
