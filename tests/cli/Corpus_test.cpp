// SPDX-License-Identifier: MIT
// The program over folders of songs, good and bad, that each test makes.

#include "tests/cli/Archives.h"
#include "tests/support/ScratchFolder.h"
#include "tests/support/Transcript.h"

#include <doctest/doctest.h>
#include <fmt/format.h>
#include <nlohmann/json.hpp>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

namespace brindle::test {
namespace {

namespace fs = std::filesystem;
using nlohmann::json;

const std::string kTwoCharts =
    "<html><a href=\"irealbook://One=Me=Swing=C=n=T44C |G7 |C Z=Two=You=Swing=F=n=T44F |C7 |F Z\">";

/// A folder with files by their names, in which the program is run.
struct CCorpusFolder {
    explicit CCorpusFolder(const TMembers& files) {
        for (const auto& [name, content] : files) Write(name, content);
    }

    void Write(const std::string& name, const std::string& content) const {
        fs::create_directories(fs::path(mFolder.File(name)).parent_path());
        std::ofstream(mFolder.File(name), std::ios::binary) << content;
    }
    [[nodiscard]] std::string Read(const std::string& name) const {
        return ReadFile(mFolder.File(name));
    }
    [[nodiscard]] std::string Run(const std::string& command) const {
        return RunCommand(fmt::format("cd '{}' && {}", mFolder.Path(), command)).mShown;
    }
    /// What `brindle corpus` with these words writes, and its exit status.
    [[nodiscard]] std::string Lines(const std::string& words, int status = 0) const {
        const std::string shown = Run("brindle corpus " + words + " >out 2>told; echo $?");
        CHECK(shown == fmt::format("{}\n", status));
        return Read("out");
    }

    CScratchFolder mFolder;
};

/// Of each line "path:member#number key", or the fault instead of the key.
std::vector<std::string> Digest(const std::string& lines) {
    std::vector<std::string> digest;
    std::istringstream stream(lines);
    for (std::string text; std::getline(stream, text);) {
        const json line = json::parse(text);
        std::string source = line["Path"];
        if (line["Member"].is_string()) source += ":" + line["Member"].get<std::string>();
        if (line["Songs"] > 1) source += fmt::format("#{}", line["Number"].get<int>());
        const bool hasFault = line["Reading"].is_null();
        CHECK((!hasFault || line["Fault"].is_object()));
        digest.push_back(source + " " +
                         (hasFault ? line["Fault"]["Text"] : line["Reading"]["SignKey"]["Name"])
                             .get<std::string>());
    }
    return digest;
}

using TDigest = std::vector<std::string>;

/// Many small songs in two folders, an archive and a page.
TMembers ManySongs(int count) {
    TMembers files{{"songs/page.html", kTwoCharts}};
    TMembers members;
    for (int i = 0; i < count; ++i) {
        files.emplace_back(fmt::format("songs/{}/{}.txt", i % 2, i), "Dm7 G7 | C A7 | Dm7 G7 | C");
        members.emplace_back(fmt::format("{}.txt", i), i % 7 == 3 ? "C Q?" : "Cm7 F7 | Bb");
    }
    files.emplace_back("songs/z.tar.gz", PackedArchive("tar.gz", members));
    return files;
}

std::vector<std::string> SortedLines(const std::string& text) {
    std::vector<std::string> lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);) lines.push_back(line);
    std::sort(lines.begin(), lines.end());
    return lines;
}

TEST_CASE("A corpus has a line for each song of folders, pages and archives, in their order") {
    const TMembers inner{{"deep/g.txt", "G D7 | G"}, {"deep/.h.txt", "C"}, {"note.pdf", "?"}};
    const CCorpusFolder folder(
        {{"s/b.txt", "C G7 | C"},
         {"s/a.txt", "F C7 | F"},
         {"s/B/c.cho", "{title: Cho}\n[Dm]la [A7]la [Dm]la\n"},
         {"s/.hidden.txt", "C"},
         {"s/.git/x.txt", "C"},
         {"s/picture.png", "?"},
         {"s/c.html", kTwoCharts},
         {"s/d.zip",
          PackedArchive("zip", {{"z.txt", "D A7 | D"}, {"in.tar", PackedArchive("tar", inner)}})},
         {"s/e.tar.xz", PackedArchive("tar.xz", inner)}});
    const TDigest expected{"s/B/c.cho D Minor",
                           "s/a.txt F Major",
                           "s/b.txt C Major",
                           "s/c.html#1 C Major",
                           "s/c.html#2 F Major",
                           "s/d.zip:z.txt D Major",
                           "s/d.zip:in.tar/deep/g.txt G Major",
                           "s/e.tar.xz:deep/g.txt G Major"};
    CHECK(Digest(folder.Lines("s")) == expected);
    for (const char* const options : {" --jobs 1", " --jobs 2", " --jobs 7"}) {
        CHECK(folder.Read("out") == folder.Lines(std::string("s") + options));
    }
    CHECK(Digest(folder.Lines("s/b.txt s/B s/.hidden.txt s/b.txt")) ==
          TDigest{"s/b.txt C Major", "s/B/c.cho D Minor", "s/.hidden.txt C Major",
                  "s/b.txt C Major"});
    const json line = json::parse(folder.Lines("s/B"));
    CHECK(line["Title"] == "Cho");
    CHECK(line["Reading"]["Chords"][1]["Numeral"] == "V7");
    // One file of standard input, also an archive.
    CHECK(Digest(folder.Lines("- <s/e.tar.xz")) == TDigest{"-:deep/g.txt G Major"});
}

TEST_CASE("A score in a container is one song, under any name and in an archive") {
    const std::string score =
        ReadFile(BRINDLE_SOURCE_DIR "/examples/scores/beautiful-dreamer.musicxml");
    const std::string packed = PackedArchive(
        "zip", {{"META-INF/container.xml",
                 "<container><rootfiles><rootfile full-path=\"s.xml\"/></rootfiles></container>"},
                {"s.xml", score}});
    const CCorpusFolder folder(
        {{"s/a.mxl", packed},
         {"s/b.musicxml", score},
         {"s/c.zip", packed},
         {"s/d.zip", PackedArchive("zip", {{"x.mxl", packed}, {"y.xml", packed}})}});
    TDigest digest = Digest(folder.Lines("s"));
    REQUIRE(digest.size() == 5);
    for (std::string& line : digest) line = line.substr(line.find(' '));
    CHECK(digest == TDigest(5, digest[1]));
}

TEST_CASE("What cannot be read has a line, and the rest is read all the same") {
    const CCorpusFolder folder({{"s/a.txt", "C G7 | C"},
                                {"s/b.txt", "C Q? | C"},
                                {"s/c.txt", ""},
                                {"s/d.xml", "<score"},
                                {"s/e.mxl", "PK\3\4 damaged"},
                                {"s/f.zip", "PK\3\4 damaged"},
                                {"s/g.tar.gz", "\x1F\x8B damaged"},
                                {"s/h.html", "<html>none"},
                                {"s/z.txt", "D A7 | D"}});
    fs::create_symlink("nowhere.txt", folder.mFolder.File("s/y.txt"));
    const std::string lines = folder.Lines("s missing.txt", 1);
    TDigest digest = Digest(lines);
    REQUIRE(digest.size() == 11);
    CHECK(digest.front() == "s/a.txt C Major");
    CHECK(digest[8] == "s/y.txt there is no such file");
    CHECK(digest[9] == "s/z.txt D Major");
    CHECK(digest[10] == "missing.txt there is no such file");
    CHECK(folder.Read("told") == "brindle: 9 of 11 songs cannot be read; their lines tell why\n");
    const json fault = json::parse(lines.substr(
        lines.find('\n') + 1, lines.find("\n{", lines.find('\n') + 1) - lines.find('\n') - 1));
    CHECK(fault["Fault"]["Line"] == 1);
    CHECK(fault["Fault"]["Column"].is_number());
    CHECK(Digest(folder.Lines("--lenient s/b.txt")) == TDigest{"s/b.txt C Major"});
    CHECK(folder.Lines("s/none s/b.txt", 1).find("s/none") != std::string::npos);
}

TEST_CASE("Links into a ring end, pipes of a folder are not waited for, and names are only names") {
    const CCorpusFolder folder(
        {{"s/a/x.txt", "C G7 | C"},
         {"s/b.tar", PackedArchive("tar", {{"../../up.txt", "C"}, {"/abs.txt", "C"}})}});
    fs::create_directory_symlink("..", folder.mFolder.File("s/a/ring"));
    fs::create_directory_symlink(".", folder.mFolder.File("s/self"));
    CHECK(folder.Run("mkfifo s/pipe.txt; brindle corpus s >out; echo $?") == "0\n");
    CHECK(Digest(folder.Read("out")) ==
          TDigest{"s/a/x.txt C Major", "s/b.tar:../../up.txt C Major", "s/b.tar:/abs.txt C Major"});
    CHECK_FALSE(fs::exists(folder.mFolder.File("../up.txt")));
}

TEST_CASE(
    "Links in an archive are not followed, and those named as songs have a line that says so") {
    const CCorpusFolder folder(TMembers{{"a.txt", "C G7 | C"}});
    (void)folder.Run(
        "ln -s a.txt l.txt; ln a.txt h.txt; ln -s . up; tar cf s.tar a.txt h.txt l.txt up");
    const std::string fault = " it is a link, and links in archives are not followed";
    CHECK(Digest(folder.Lines("s.tar", 1)) ==
          TDigest{"s.tar:a.txt C Major", "s.tar:h.txt" + fault, "s.tar:l.txt" + fault});
}

TEST_CASE("Archives that are made to fill a memory are given up") {
    const std::string zeros(65 << 20, ' ');
    const std::string large = PackedArchive("zip", {{"large.txt", zeros}, {"ok.txt", "C G7 | C"}});
    std::string nested = PackedArchive("zip", {{"x.txt", "C"}});
    for (int i = 0; i < 5; ++i) nested = PackedArchive("zip", {{fmt::format("{}.zip", i), nested}});
    TMembers bomb;
    for (int i = 0; i < 20; ++i) bomb.emplace_back(fmt::format("{}.txt", i), zeros.substr(2 << 20));
    const CCorpusFolder folder({{"large.zip", large},
                                {"nested.zip", nested},
                                {"bomb.tar.bz2", PackedArchive("tar.bz2", bomb)}});
    CHECK(Digest(folder.Lines("large.zip", 1)) ==
          TDigest{"large.zip:large.txt it is larger than 64 MiB", "large.zip:ok.txt C Major"});
    CHECK(Digest(folder.Lines("nested.zip", 1)) ==
          TDigest{"nested.zip:4.zip/3.zip/2.zip archives lie too deep"});
    const TDigest bombed = Digest(folder.Lines("bomb.tar.bz2", 1));
    CHECK(bombed.size() <= 6);
    CHECK(bombed.back() == "bomb.tar.bz2 it holds more than 200 times its own size");
}

TEST_CASE("Unordered lines are the same lines") {
    const CCorpusFolder folder(ManySongs(60));
    const std::string ordered = folder.Lines("songs", 1);
    CHECK(SortedLines(ordered) == SortedLines(folder.Lines("songs --unordered --jobs 3", 1)));
}

TEST_CASE("A run that was cut off anywhere goes on to the same whole") {
    const CCorpusFolder folder(ManySongs(30));
    const std::string whole = folder.Lines("songs --jobs 2", 1);
    for (const std::size_t length :
         {std::size_t{0}, std::size_t{1}, whole.find('\n'), whole.find('\n') + 1, whole.size() / 2,
          whole.size() - 1, whole.size()}) {
        CAPTURE(length);
        folder.Write("out", whole.substr(0, length));
        (void)folder.Run("brindle corpus songs --skip-done out >>out 2>told");
        CHECK(folder.Read("out") == whole);
        // Into another file, with what was half written told.
        const std::size_t end = whole.substr(0, length).rfind('\n') + 1;
        folder.Write("before", whole.substr(0, length));
        (void)folder.Run("brindle corpus songs --skip-done before >rest 2>told");
        CHECK(whole.substr(0, end) + folder.Read("rest") == whole);
        CHECK((folder.Read("told").find("midst") != std::string::npos) == (end != length));
    }
    folder.Write("other", "{\"a\":1}\n");
    CHECK(folder.Run("brindle corpus songs --skip-done other") ==
          "[stderr]\nbrindle: --skip-done: other is no output of brindle corpus\n[status 1]\n");
}

TEST_CASE("Killed in the midst, a run goes on to the whole; asked to end, it leaves whole lines") {
    const CCorpusFolder folder(ManySongs(400));
    const std::string whole = folder.Lines("songs", 1);
    for (const std::string signal : {"KILL", "INT", "TERM"}) {
        CAPTURE(signal);
        // A shell with jobs, as at a terminal, does not switch Ctrl-C off for what runs beside it.
        (void)folder.Run(
            fmt::format("rm -f out; set -m; '{}' corpus songs --jobs 1 >out 2>told & "
                        "while ! test -s out; do sleep 0.01; done; kill -{} $!; wait $!",
                        BRINDLE_PROGRAM, signal));
        const std::string part = folder.Read("out");
        CHECK(whole.compare(0, part.size(), part) == 0);
        if (signal != "KILL") CHECK(part.back() == '\n');
        (void)folder.Run("brindle corpus songs --skip-done out >>out 2>told");
        CHECK(folder.Read("out") == whole);
    }
}

TEST_CASE("One signal ends a run that waits for a pipe, behind a whole line") {
    const CCorpusFolder folder(TMembers{{"a.txt", "C G7 | C"}});
    for (const std::string words : {"pipe", "- <pipe"}) {
        CAPTURE(words);
        // The shell holds the pipe open; what does not end is killed, with another exit status.
        const std::string shown = folder.Run(
            fmt::format("rm -f out pipe; mkfifo pipe; exec 3<>pipe; set -m; "
                        "'{}' corpus --jobs 1 a.txt {} >out 2>told & run=$!; "
                        "while ! test -s out; do sleep 0.01; done; sleep 0.1; kill -TERM $run; "
                        "for i in $(seq 100); do kill -0 $run 2>told || break; sleep 0.1; done; "
                        "kill -KILL $run 2>told; wait $run 2>told; echo $?",
                        BRINDLE_PROGRAM, words));
        CHECK(shown.starts_with("143"));
        CHECK(Digest(folder.Read("out")) == TDigest{"a.txt C Major"});
    }
    CHECK(folder.Run("((sleep 0.2; echo 'F C7 | F' >pipe) & brindle corpus pipe >out; echo $?)") ==
          "0\n");
    CHECK(Digest(folder.Read("out")) == TDigest{"pipe F Major"});
}

TEST_CASE("An output that takes no more ends the work") {
    const CCorpusFolder folder(ManySongs(50));
    CHECK(folder.Run("brindle corpus songs 2>told | head -1 | wc -l") == "1\n");
    CHECK(
        folder
            .Run(
                "(trap '' PIPE; brindle corpus songs --jobs 2; echo $? >status) | true; cat status")
            .find("1\n") != std::string::npos);
    if (fs::exists("/dev/full")) {
        CHECK(folder.Run("brindle corpus songs >/dev/full") ==
              "[stderr]\nbrindle: the output cannot be written: No space left on device\n"
              "[status 1]\n");
    }
}

}  // namespace
}  // namespace brindle::test
