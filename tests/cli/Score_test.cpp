// SPDX-License-Identifier: MIT
// What the program makes of scores, beside what the library makes of them.

#include "tests/support/Transcript.h"

#include "brindle/analysis/CHarmonicAnalyse.h"

#include <doctest/doctest.h>

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
