// SPDX-License-Identifier: MIT
// What may stand where a file is to be written, and what a writer may leave behind.
#include "tests/support/ScratchFolder.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/FileTree.h"

#include <doctest/doctest.h>

#include <fcntl.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/sysmacros.h>
#include <sys/time.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <ctime>
#include <filesystem>
#include <ostream>
#include <stdexcept>
#include <string>
#include <string_view>
#include <thread>
#include <vector>

using namespace brindle;
using brindle::test::CScratchFolder;

namespace fs = std::filesystem;

namespace {

mode_t ModeOf(const std::string& path) {
    struct stat status {};
    REQUIRE(lstat(path.c_str(), &status) == 0);
    return status.st_mode;
}

std::vector<std::string> NamesIn(const fs::path& folder) {
    std::vector<std::string> names;
    for (const auto& entry : fs::directory_iterator(folder))
        names.push_back(entry.path().filename());
    std::sort(names.begin(), names.end());
    return names;
}

std::size_t OpenFiles() {
    return NamesIn("/proc/self/fd").size();
}

void MakeOlder(const std::string& path, long seconds) {
    const timeval then{std::time(nullptr) - seconds, 0};
    const timeval times[2] = {then, then};
    REQUIRE(utimes(path.c_str(), times) == 0);
}

/// Sets the mask of the process and gives it back.
class CMask {
public:
    explicit CMask(mode_t mask) : mOld(umask(mask)) {}
    CMask(const CMask&) = delete;
    CMask& operator=(const CMask&) = delete;
    ~CMask() { umask(mOld); }

private:
    mode_t mOld;
};

FileNode TreeWith(const std::string& content) {
    FileNode tree;
    tree.mIsFolder = true;
    tree.mChildren["file"].mContents = content;
    return tree;
}

}  // namespace

TEST_CASE("A link is followed, and one to nothing makes what it names") {
    const CScratchFolder folder;
    fs::create_directory(folder.File("deep"));
    REQUIRE(WriteFileAtomically(folder.File("deep/file"), "old"));
    fs::create_symlink("deep/file", folder.File("one"));
    fs::create_symlink("one", folder.File("two"));
    fs::create_symlink("deep/new", folder.File("dangling"));
    fs::create_symlink("ring", folder.File("ring"));
    fs::create_symlink("deep", folder.File("folder"));

    CHECK(WriteFileAtomically(folder.File("two"), "through two links"));
    CHECK(ReadWholeFile(folder.File("deep/file")) == "through two links");
    CHECK(WriteFileAtomically(folder.File("dangling"), "through a dangling one"));
    CHECK(ReadWholeFile(folder.File("deep/new")) == "through a dangling one");
    CHECK_FALSE(WriteFileAtomically(folder.File("ring"), "x"));
    CHECK_FALSE(WriteFileAtomically(folder.File("folder"), "x"));
    for (const char* const link : {"one", "two", "dangling", "ring", "folder"}) {
        CHECK(S_ISLNK(ModeOf(folder.File(link))));
    }
    CHECK(NamesIn(folder.File("deep")) == std::vector<std::string>{"file", "new"});
}

TEST_CASE("A folder is written behind links, too") {
    const CScratchFolder folder;
    fs::create_symlink("there", folder.File("dangling"));
    REQUIRE(WriteFolderAtomically(folder.File("dangling"), TreeWith("one")));
    CHECK(ReadWholeFile(folder.File("there/file")) == "one");
    REQUIRE(WriteFolderAtomically(folder.File("dangling/"), TreeWith("two")));
    CHECK(ReadWholeFile(folder.File("there/file")) == "two");
    CHECK(S_ISLNK(ModeOf(folder.File("dangling"))));
    CHECK(NamesIn(folder.Path()) == std::vector<std::string>{"dangling", "there"});
}

TEST_CASE("Links in a folder that lead out of it stay, and what they name is written") {
    const CScratchFolder folder;
    const std::string path = folder.File("package");
    fs::create_directory(folder.File("elsewhere"));
    fs::create_directory(path);
    const auto tree = [](const std::string& content) {
        FileNode result = TreeWith(content);
        for (const char* const name : {"inside", "relative", "dangling", "ring"}) {
            result.mChildren[name].mContents = content + " " + name;
        }
        return result;
    };
    REQUIRE(WriteFileAtomically(folder.File("elsewhere/one"), "old"));
    REQUIRE(WriteFileAtomically(folder.File("elsewhere/unnamed"), "old"));
    fs::create_symlink(folder.File("elsewhere/one"), path + "/file");
    fs::create_symlink("../elsewhere/two", path + "/relative");
    fs::create_symlink("../elsewhere/three", path + "/dangling");
    fs::create_symlink("file beside", path + "/inside");
    fs::create_symlink("ring", path + "/ring");
    fs::create_symlink("../elsewhere/unnamed", path + "/not in the tree");
    for (const char* const content : {"first", "second"}) {
        REQUIRE(WriteFolderAtomically(path, tree(content)));
        for (const char* const link : {"/file", "/relative", "/dangling"}) {
            CHECK(S_ISLNK(ModeOf(path + link)));
        }
        for (const char* const name : {"inside", "ring", "relative", "dangling"}) {
            CHECK(ReadWholeFile(path + "/" + name) == std::string(content) + " " + name);
        }
        CHECK(ReadWholeFile(folder.File("elsewhere/one")) == content);
        CHECK(ReadWholeFile(folder.File("elsewhere/two")) == std::string(content) + " relative");
    }
    CHECK(S_ISREG(ModeOf(path + "/inside")));
    CHECK(NamesIn(path) ==
          std::vector<std::string>{"dangling", "file", "inside", "relative", "ring"});
    CHECK(ReadWholeFile(folder.File("elsewhere/unnamed")) == "old");
    CHECK(NamesIn(folder.Path()) == std::vector<std::string>{"elsewhere", "package"});
}

TEST_CASE("A link in a folder to what cannot be written leaves the folder as it was") {
    const CScratchFolder folder;
    const std::string path = folder.File("package");
    fs::create_directories(folder.File("elsewhere/folder"));
    REQUIRE(WriteFolderAtomically(path, TreeWith("old")));
    fs::create_symlink("../elsewhere/folder", path + "/link");
    FileNode tree = TreeWith("new");
    tree.mChildren["link"].mContents = "x";
    CHECK_FALSE(WriteFolderAtomically(path, tree));
    CHECK(ReadWholeFile(path + "/file") == "old");
    CHECK(NamesIn(folder.Path()) == std::vector<std::string>{"elsewhere", "package"});
}

TEST_CASE("A pipe takes the bytes and stays a pipe") {
    const CScratchFolder folder;
    const std::string path = folder.File("pipe");
    REQUIRE(mkfifo(path.c_str(), 0600) == 0);
    std::optional<std::string> read;
    std::thread reader([&] { read = ReadWholeFile(path); });
    CHECK(WriteFileAtomically(path, [](std::ostream& stream) { stream << "into the pipe"; }));
    reader.join();
    CHECK(read == "into the pipe");
    CHECK(S_ISFIFO(ModeOf(path)));
}

TEST_CASE("A pipe is written by the name of its descriptor, which is a link to no file") {
    std::array<int, 2> ends{};
    REQUIRE(pipe(ends.data()) == 0);
    CHECK(WriteFileAtomically("/dev/fd/" + std::to_string(ends[1]), "into the pipe"));
    CHECK(close(ends[1]) == 0);
    std::array<char, 32> bytes{};
    const auto count = read(ends[0], bytes.data(), bytes.size());
    CHECK(std::string_view(bytes.data(), count > 0 ? static_cast<std::size_t>(count) : 0) ==
          "into the pipe");
    CHECK(close(ends[0]) == 0);
}

TEST_CASE("A device stays a device") {
    const CScratchFolder folder;
    const std::string path = folder.File("null");
    if (mknod(path.c_str(), S_IFCHR | 0666, makedev(1, 3)) != 0) {
        MESSAGE("this process may make no devices: none was tried");
        return;
    }
    // Where devices are switched off for the file system it cannot be opened.
    const int opened = open(path.c_str(), O_WRONLY);
    if (opened >= 0) close(opened);
    CHECK(WriteFileAtomically(path, "into nothing") == (opened >= 0));
    CHECK_FALSE(WriteFolderAtomically(path, TreeWith("x")));
    CHECK(S_ISCHR(ModeOf(path)));
    CHECK(NamesIn(folder.Path()) == std::vector<std::string>{"null"});
}

TEST_CASE("A new file has the rights that the process gives, an old one keeps its own") {
    const CScratchFolder folder;
    const CMask mask(027);
    REQUIRE(WriteFileAtomically(folder.File("new"), "x"));
    CHECK((ModeOf(folder.File("new")) & 07777) == 0640);
    REQUIRE(chmod(folder.File("new").c_str(), 0606) == 0);
    REQUIRE(WriteFileAtomically(folder.File("new"), "y"));
    CHECK((ModeOf(folder.File("new")) & 07777) == 0606);
    REQUIRE(WriteFolderAtomically(folder.File("folder"), TreeWith("x")));
    CHECK((ModeOf(folder.File("folder")) & 07777) == 0750);
    REQUIRE(WritePrivateFileAtomically(folder.File("private"), "x"));
    CHECK((ModeOf(folder.File("private")) & 07777) == 0600);
}

TEST_CASE("Threads that write leave the mask of the process alone") {
    const CScratchFolder folder;
    const CMask mask(077);
    std::vector<std::thread> writers;
    for (const char* const name : {"a", "b"}) {
        writers.emplace_back([&folder, name] {
            for (int n = 0; n < 300; ++n) {
                (void)WriteFileAtomically(folder.File(name + std::to_string(n)), "x");
            }
        });
    }
    for (std::thread& writer : writers) writer.join();
    const auto names = NamesIn(folder.Path());
    CHECK(names.size() == 600);
    CHECK(std::all_of(names.begin(), names.end(), [&](const std::string& name) {
        return (ModeOf(folder.File(name)) & 07777) == 0600;
    }));
    CHECK(umask(077) == 077);
}

TEST_CASE("A writer that throws leaves the old file, nothing beside it and nothing open") {
    const CScratchFolder folder;
    REQUIRE(WriteFileAtomically(folder.File("file"), "old"));
    const std::size_t openBefore = OpenFiles();
    for (int n = 0; n < 10; ++n) {
        CHECK_THROWS_AS((void)WriteFileAtomically(folder.File("file"),
                                                  [](std::ostream& stream) {
                                                      stream << "half of ";
                                                      throw std::runtime_error("it");
                                                  }),
                        std::runtime_error);
    }
    CHECK(OpenFiles() == openBefore);
    CHECK(NamesIn(folder.Path()) == std::vector<std::string>{"file"});
    CHECK(ReadWholeFile(folder.File("file")) == "old");
}

TEST_CASE("What a killed writer has left is removed after an hour, and nothing else") {
    const CScratchFolder folder;
    const std::string path = folder.File("file");
    // What a writer leaves that is killed in the middle of its work.
    const pid_t child = fork();
    if (child == 0) {
        (void)WriteFileAtomically(path, [](std::ostream&) { _exit(0); });
        _exit(1);
    }
    waitpid(child, nullptr, 0);
    const auto left = NamesIn(folder.Path());
    REQUIRE(left.size() == 1);
    const std::string scratch = folder.File(left[0]);

    MakeOlder(scratch, 3000);
    REQUIRE(WriteFileAtomically(path, "x"));
    CHECK(fs::exists(scratch));
    MakeOlder(scratch, 4000);
    // The names of others that look alike.
    const std::vector<std::string> others{"file.brindle-",       "file.brindle-abcdefg",
                                          "file.brindle-ABCDEF", "files.brindle-abcdef",
                                          "file.abcdef",         "file.brindle-abcdef.old"};
    for (const std::string& other : others) {
        REQUIRE(WriteFileAtomically(folder.File(other), "of value"));
        MakeOlder(folder.File(other), 4000);
    }
    REQUIRE(WriteFileAtomically(path, "y"));
    CHECK_FALSE(fs::exists(scratch));
    for (const std::string& other : others) CHECK(fs::exists(folder.File(other)));

    const std::string oldFolder = folder.File("tree.brindle-abcdef");
    REQUIRE(WriteFolderAtomically(oldFolder, TreeWith("left")));
    MakeOlder(oldFolder, 4000);
    REQUIRE(WriteFolderAtomically(folder.File("tree"), TreeWith("x")));
    CHECK_FALSE(fs::exists(oldFolder));
}

TEST_CASE("A writer takes nothing away that another kind of writer would have left") {
    const CScratchFolder folder;
    const std::string file = folder.File("file");
    REQUIRE(WriteFolderAtomically(folder.File("file.brindle-abcdef"), TreeWith("of value")));
    fs::create_directory(folder.File("file.brindle-ghijkl"));
    REQUIRE(WriteFileAtomically(folder.File("tree.brindle-abcdef"), "of value"));
    const std::vector<std::string> others{"file.brindle-abcdef", "file.brindle-ghijkl",
                                          "tree.brindle-abcdef"};
    for (const std::string& other : others) MakeOlder(folder.File(other), 4000);
    REQUIRE(WriteFileAtomically(file, "x"));
    REQUIRE(WriteFolderAtomically(folder.File("tree"), TreeWith("x")));
    CHECK(NamesIn(folder.Path()) == std::vector<std::string>{"file", "file.brindle-abcdef",
                                                             "file.brindle-ghijkl", "tree",
                                                             "tree.brindle-abcdef"});
    CHECK(ReadWholeFile(folder.File("file.brindle-abcdef/file")) == "of value");
}

TEST_CASE("What cannot be written leaves its reason in errno") {
    const CScratchFolder folder;
    fs::create_directory(folder.File("folder"));
    fs::create_symlink("ring", folder.File("ring"));
    REQUIRE(WriteFileAtomically(folder.File("file"), "old"));
    struct CRow {
        std::string mName;
        int mReason;
    };
    const CRow rows[] = {
        {"no/such", ENOENT},
        {"file/below", ENOTDIR},
        {"folder", EISDIR},
        {"ring", ELOOP},
        {std::string(256, 'n'), ENAMETOOLONG},
    };
    for (const CRow& row : rows) {
        INFO(row.mName);
        errno = 0;
        CHECK_FALSE(WriteFileAtomically(folder.File(row.mName), "x"));
        CHECK(errno == row.mReason);
    }

    // A disk without space: the file is larger than the process may write.
    rlimit old{};
    REQUIRE(getrlimit(RLIMIT_FSIZE, &old) == 0);
    const rlimit small{1'000, old.rlim_max};
    REQUIRE(setrlimit(RLIMIT_FSIZE, &small) == 0);
    const auto handler = signal(SIGXFSZ, SIG_IGN);
    const bool isWritten = WriteFileAtomically(folder.File("file"), std::string(2'000, 'x'));
    const int reason = errno;
    const bool isStreamed = WriteFileAtomically(
        folder.File("file"), [](std::ostream& stream) { stream << std::string(200'000, 'x'); });
    const int reasonOfStream = errno;
    signal(SIGXFSZ, handler);
    REQUIRE(setrlimit(RLIMIT_FSIZE, &old) == 0);
    CHECK_FALSE(isWritten);
    CHECK(reason == EFBIG);
    CHECK_FALSE(isStreamed);
    CHECK(reasonOfStream == EFBIG);
    CHECK(ReadWholeFile(folder.File("file")) == "old");
}

TEST_CASE("A name of the longest length can be written") {
    const CScratchFolder folder;
    const std::string name(255, 'n');
    CHECK(WriteFileAtomically(folder.File(name), "x"));
    CHECK(NamesIn(folder.Path()) == std::vector<std::string>{name});
}
