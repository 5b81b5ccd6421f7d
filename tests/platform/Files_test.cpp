// SPDX-License-Identifier: MIT
#include "tests/support/ScratchFolder.h"

#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/ZipContainer.h"

#include <doctest/doctest.h>
#include <zip.h>

#include <filesystem>
#include <string>
#include <vector>

using namespace brindle;
using brindle::test::CScratchFolder;

namespace {

struct CZipEntry {
    const char* mName;
    std::string mContents;
};

std::string ZipOf(const std::string& path, const std::vector<CZipEntry>& entries) {
    zip_t* archive = zip_open(path.c_str(), ZIP_CREATE | ZIP_TRUNCATE, nullptr);
    for (const CZipEntry& entry : entries) {
        zip_source_t* source =
            zip_source_buffer(archive, entry.mContents.data(), entry.mContents.size(), 0);
        zip_file_add(archive, entry.mName, source, ZIP_FL_ENC_UTF_8);
    }
    REQUIRE(zip_close(archive) == 0);
    return ReadWholeFile(path).value();
}

}  // namespace

TEST_CASE("A zip container is a tree of files") {
    const CScratchFolder folder;
    const std::string bytes = ZipOf(folder.File("a.zip"), {{"META-INF/container.xml", "<c/>"},
                                                           {"score.xml", std::string(100'000, 'x')},
                                                           {"../../up.txt", "up"}});
    const auto root = UnpackZip(bytes);
    REQUIRE(root.has_value());
    CHECK(root->Child("META-INF")->Child("container.xml")->mContents == "<c/>");
    CHECK(root->Child("score.xml")->mContents.size() == 100'000);
    CHECK(root->Child("META-INF/container.xml") == nullptr);

    CHECK_FALSE(UnpackZip("not a zip").has_value());
    CHECK_FALSE(UnpackZip("").has_value());
    for (std::size_t length = 1; length < bytes.size(); length += 7) {
        CHECK_FALSE(UnpackZip(std::string_view(bytes).substr(0, length)).has_value());
    }
    std::string damaged = bytes;
    damaged[60] = static_cast<char>(damaged[60] ^ 0x55);
    (void)UnpackZip(damaged);
}

TEST_CASE("A zip bomb is refused") {
    const CScratchFolder folder;
    const std::string bytes =
        ZipOf(folder.File("bomb.zip"), {{"score.xml", std::string(kZipMaxUnpackedSize + 1, '\0')}});
    CHECK(bytes.size() < 1'000'000);
    CHECK_FALSE(UnpackZip(bytes).has_value());
}

TEST_CASE("A file is replaced as a whole or not at all") {
    const CScratchFolder folder;
    const auto path = folder.File("file.txt");
    CHECK(WriteFileAtomically(path, "one"));
    CHECK(WriteFileAtomically(path, "two"));
    CHECK(ReadWholeFile(path) == "two");
    CHECK_FALSE(ReadWholeFile(path, 2).has_value());
    CHECK_FALSE(WriteFileAtomically(folder.File("missing/file.txt"), "x"));
    CHECK_FALSE(WriteFileAtomically(folder.Path(), "a folder stands here"));
    CHECK(std::distance(std::filesystem::directory_iterator(folder.Path()), {}) == 1);
    CHECK_FALSE(ReadWholeFile(folder.File("missing")).has_value());
}
