// SPDX-License-Identifier: MIT
#include "brindle/song/FindSongFiles.h"

#include "tests/support/ScratchFolder.h"

#include <doctest/doctest.h>

#include <fstream>

using namespace brindle;
using namespace brindle::test;

TEST_CASE("Folders are walked in alphabetic order for files that may be songs") {
    const CScratchFolder folder;
    std::filesystem::create_directories(folder.File("songs/more"));
    for (const char* const name :
         {"songs/b.txt", "songs/a.mxl", "songs/notes.pdf", "songs/more/c.musicxml", "one.cho"}) {
        std::ofstream(folder.File(name)) << "C";
    }
    const auto files =
        FindSongFiles({folder.File("one.cho"), folder.File("songs"), folder.File("none.txt")});
    REQUIRE(files.size() == 5);
    CHECK(files[0].mPath == folder.File("one.cho"));
    CHECK(files[1].mPath == folder.File("songs/a.mxl"));
    CHECK(files[2].mPath == folder.File("songs/b.txt"));
    CHECK(files[3].mPath == folder.File("songs/more/c.musicxml"));
    CHECK(files[4].mPath == folder.File("none.txt"));
    for (const CFoundFile& file : files) {
        CHECK(file.mIsNamed == (&file == &files[0] || &file == &files[4]));
    }
}
