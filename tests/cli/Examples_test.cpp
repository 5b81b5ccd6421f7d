// SPDX-License-Identifier: MIT
// The examples at the top of each help work, in a folder that has the files that they name.

#include "tests/support/ScratchFolder.h"
#include "tests/support/Transcript.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <set>
#include <sstream>
#include <string>

namespace brindle::test {
namespace {

// Run where the examples of the project and the lead sheets of the tests are at hand.
constexpr const char* kFilesOfExamples = R"(
mkdir songs more-songs scores home home/.zfunc
mkdir -p home/.local/share/man/man1 home/.local/share/bash-completion/completions \
    home/.config/fish/completions
cp examples/songs/*.txt songs; cp examples/songs/a*.txt more-songs
cp examples/songs/greensleeves.txt song.txt; echo '{title: A} [Am]la [E7]la [Am]' >song.cho
cp examples/scores/beautiful-dreamer.musicxml song.musicxml; cp song.musicxml song.xml
cp examples/scores/*.musicxml scores; cp examples/scores/prelude-in-c.musicxml piano.musicxml
cp leadsheets/fur_elise.mxl song.mxl; cp song.mxl chorale.mxl
echo '<html><a href="irealbook://One=Me=Swing=C=n=T44C |G7 |C Z">' >charts.html
python3 -m zipfile -c scores.zip scores/beautiful-dreamer.musicxml; tar czf more.tar.gz songs
echo 'Am7 D7 G' >symbols.txt
echo '000 100000000000 1000000 000000000000 000010000000' >vectors.txt
echo 'm1 C: I b3 V7' >analysis.txt; echo 'C4 E4 G4' >chords.txt
printf 'C\nBb minor\n' | tee keys.txt >scales.txt
brindle grids export >grids.json; brindle grids import my.gchdb <grids.json
brindle markov learn -o model.json songs; cp model.json songs.json
brindle markov learn --plain --order 3 -o plain.json songs; brindle corpus songs >songs.jsonl
)";

/// The examples of a command and of those below it.
void CollectExamples(const std::string& command, std::set<std::string>& examples) {
    std::istringstream help(RunCommand("brindle " + command + " --help").mShown);
    bool isOfCommands = false;
    std::string line;
    std::getline(help, line);
    CHECK(line == "Examples:");
    while (std::getline(help, line) && line.starts_with("  ")) examples.insert(line.substr(2));
    while (std::getline(help, line)) {
        if (line.ends_with(':')) isOfCommands = line == "Subcommands:";
        if (!isOfCommands || !line.starts_with("  ")) continue;
        const std::string name = line.substr(2, line.find_first_of(" ,", 2) - 2);
        CollectExamples(command + (command.empty() ? "" : " ") + name, examples);
    }
}

TEST_CASE("The examples of the help work") {
    std::set<std::string> examples;
    CollectExamples("", examples);
    CHECK(examples.size() > 80);
    const CScratchFolder prepared;
    const std::string folder = prepared.Path();
    // What other programs make of the output is theirs, where they are not installed.
    const std::string setUp = fmt::format(
        "cp -r '{}/.' . && export HOME=$PWD/home; for program in jq man; do command -v $program "
        ">/dev/null || eval \"$program() {{ cat; }}\"; done; set -o pipefail; ",
        folder);
    const CConsoleRun made =
        RunCommand("set -e" + (kFilesOfExamples + fmt::format("mv -- * '{}'", folder)));
    CHECK_MESSAGE(made.mShown.find("[st") == made.mShown.npos, made.mShown);
    for (const std::string& example : examples) {
        INFO(example);
        const std::string shown = RunCommand(setUp + example).mShown;
        CHECK_MESSAGE(shown.find("[status ") == shown.npos, shown);
    }
}

}  // namespace
}  // namespace brindle::test
