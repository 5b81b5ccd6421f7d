// SPDX-License-Identifier: MIT
// What the program makes of scores, beside what the library makes of them.

#include "tests/cli/Archives.h"
#include "tests/support/ScratchFolder.h"
#include "tests/support/Transcript.h"

#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/platform/AtomicFile.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <sstream>
#include <string>

namespace brindle::test {
namespace {

TEST_CASE("The native reading of a score is the library's own, byte for byte") {
    for (const std::string file : {"coventry_carol.xml", "west_end_blues.musicxml"}) {
        INFO(file);
        CHarmonicAnalyse analyse;
        analyse.AnalyseFromMusicXMLFile(BRINDLE_TEST_DATA "/leadsheets/" + file,
                                        TAnalyse_TonicProgressions);
        std::ostringstream native;
        analyse.AppendJSONString(native);
        const std::string command =
            "brindle analyse leadsheets/" + file + " --timing native --format native";
        CHECK(RunCommand(command).mShown == native.str() + "\n[no end of line]\n");
    }
}

TEST_CASE("The chord text of a score is read back as the same chords at the same places") {
    const std::string compare =
        "f=leadsheets/we_three_kings.mxl; brindle harmonies $f --format chords >t 2>hint; "
        "chords() { brindle analyse \"$@\" --json --route none | "
        "grep -oE '\"(Symbol|Position)\": *[^,]*'; }; "
        "chords $f >a; chords --file t --beats-per-bar 3 >b; test -s a && cmp a b";
    CHECK(RunCommand(compare).mShown == "");
}

TEST_CASE("A score is read as a score by all commands for songs, however chord texts are read") {
    for (const std::string command : {"copies --json", "keys --json", "grids for --json"}) {
        INFO(command);
        const std::string all =
            RunCommand("brindle " + command + " leadsheets/jingle_bells.mxl").mShown;
        CHECK(all.find("DOCTYPE") == all.npos);
        CHECK(RunCommand("brindle " + command + " leadsheets/jingle_bells.mxl --symbols native")
                  .mShown == all);
    }
    for (const std::string command : {"analyse", "keys", "copies", "grids for"}) {
        CHECK(RunCommand("echo no >no.xml; brindle " + command + " no.xml").mShown ==
              "[stderr]\nbrindle: no.xml is no score in MusicXML: 1:1: Start tag expected, '<' not "
              "found\n[status 1]\n");
    }
}

TEST_CASE("A compressed score is read wherever its members stand, with or without a list of them") {
    const CScratchFolder folder;
    const std::string score =
        ReadFile(BRINDLE_SOURCE_DIR "/examples/scores/frere-jacques.musicxml");
    const std::string list =
        "<container><rootfiles><rootfile full-path='a/b/song.xml'/></rootfiles></container>";
    const std::string listName = "META-INF/container.xml";
    const TMembers packings[] = {
        {{listName, list}, {"a/b/song.xml", score}},
        {{listName, list}, {"other.xml", "<score-partwise/>"}, {"a/b/song.xml", score}},
        {{listName, "<container><rootfiles>"}, {"META-INF/x.xml", "<x/>"}, {"a/song.xml", score}},
        {{"a/b/c/song.musicxml", score}},
    };
    const std::string commands[] = {"import", "import --json", "harmonies",
                                    "harmonies --from-notes"};
    for (const std::string& command : commands) {
        const std::string plain =
            RunCommand("brindle " + command + " examples/scores/frere-jacques.musicxml").mShown;
        for (const TMembers& members : packings) {
            const std::string file = folder.File("song.mxl");
            REQUIRE(WriteFileAtomically(file, PackedArchive("zip", members)));
            INFO(command);
            INFO(members.front().second);
            CHECK(RunCommand("brindle " + command + " " + file).mShown == plain);
        }
    }
}

TEST_CASE("A fault of a score is told at its place, behind blanks and a byte order mark, too") {
    const std::string commands[] = {"import", "harmonies", "analyse", "analyse --timing native"};
    for (const std::string& command : commands) {
        const auto told = [&](const std::string& bytes) {
            return RunCommand("printf '" + bytes + "' | brindle " + command + " -").mShown;
        };
        const auto place = [&](int line, int column) {
            const std::string shown = command == "import"
                                          ? fmt::format("Line {}, column {}: ", line, column)
                                          : fmt::format("{}:{}: ", line, column);
            return "[stderr]\nbrindle: standard input: " + shown;
        };
        INFO(command);
        const bool isLenient = command == "harmonies" || command == "analyse";
        for (const std::string& mark : {std::string(), std::string("\\357\\273\\277")}) {
            const std::string head = mark + "\\n  <?xml version=\"1.0\"?>";
            // The readers of harmonies go on behind blanks.
            const auto where = isLenient ? place(3, 21) : place(2, 8);
            CHECK(told(head + "\\n<score-partwise></b></score-partwise>").starts_with(where));
            const std::string odd = "<?xml version=\"1.0\" encoding=\"Klingon\"?>";
            CHECK(told(mark + odd + "<score-partwise/>").starts_with(place(1, 39)));
        }
    }
}

TEST_CASE("A container that holds no score, or cannot be unpacked, is told as what it is") {
    const std::string empty = "printf 'PK\\005\\006'; head -c 18 /dev/zero";
    const std::string broken = "printf 'PK\\003\\004'";
    for (const std::string command : {"import", "harmonies", "analyse"}) {
        INFO(command);
        const auto told = [&](const std::string& bytes) {
            return RunCommand("{ " + bytes + "; } | brindle " + command + " -").mShown;
        };
        CHECK(told(empty) ==
              "[stderr]\nbrindle: standard input: no score in the container\n[status 1]\n");
        CHECK(told(broken) ==
              "[stderr]\nbrindle: standard input: the container cannot be unpacked\n[status 1]\n");
    }
}

}  // namespace
}  // namespace brindle::test
