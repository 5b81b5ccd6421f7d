// SPDX-License-Identifier: MIT
// What a library says that was built without the readers of scores, or without the writer of
// packages.
#include "brindle/guitarchords/GChDatabase.h"
#include "brindle/song/ReadSong.h"
#include "tests/support/ScratchFolder.h"

#include <doctest/doctest.h>

#include <filesystem>
#include <string>
#include <string_view>

namespace brindle::test {
namespace {

constexpr std::string_view kScore =
    "<?xml version=\"1.0\"?><score-partwise version=\"4.0\"><part-list><score-part id=\"P1\">"
    "<part-name/></score-part></part-list><part id=\"P1\"><measure number=\"1\"/></part>"
    "</score-partwise>";

std::string FirstFault(std::string_view bytes) {
    const CSong song = ReadSong(bytes);
    return song.mFaults.empty() ? "" : song.mFaults.front().mText;
}

}  // namespace

TEST_CASE("Scores are refused with the reason, and texts are read as ever" *
          doctest::skip(BRINDLE_HAS_SCORES)) {
    for (const std::string_view score : {kScore, std::string_view("PK\x03\x04 and more")}) {
        CHECK(FirstFault(score).find("reads no scores") != std::string::npos);
    }
    const CSong song = ReadSong("Dm7 | G7 | C");
    CHECK(song.mFaults.empty());
    CHECK(song.mChords.size() == 4);
}

TEST_CASE("No package is written, not even an empty one" * doctest::skip(BRINDLE_HAS_GRID_FILES)) {
    const CScratchFolder folder;
    const std::string path = folder.File("grids");
    CHECK_FALSE(GChCreateDbPackageAtPath(path));
    GChDatabase database(true, "");
    CHECK_FALSE(database.writeLibraries(database.allLibrariesForAnyTuning(), path));
    CHECK_FALSE(std::filesystem::exists(path));
}

}  // namespace brindle::test
