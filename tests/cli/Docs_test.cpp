// SPDX-License-Identifier: MIT
// What the documents show is true: blocks marked `console` are run and compared, commands in blocks
// marked `sh` run without an error, blocks of code stand in a file of examples/ that is built by a
// test, and pictures are what the program draws.

#include "tests/support/Transcript.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <regex>
#include <sstream>

namespace brindle::test {
namespace {

namespace fs = std::filesystem;

const std::string kRoot = BRINDLE_SOURCE_DIR;
const std::string kFence = "```";

// A document cut at its fences: text and blocks in turn, each with the fence line before it.
struct CPiece {
    std::string mLanguage;  // of a block; empty for text
    bool mIsBlock = false;
    std::string mText;
};

std::vector<CPiece> Cut(const std::string& document) {
    std::vector<CPiece> pieces(1);
    std::istringstream lines(document);
    for (std::string line; std::getline(lines, line);) {
        if (line.compare(0, kFence.size(), kFence) != 0) {
            pieces.back().mText += line + '\n';
        } else if (pieces.back().mIsBlock) {
            pieces.emplace_back();
        } else {
            pieces.push_back({line.substr(kFence.size()), true, {}});
        }
    }
    return pieces;
}

std::string Join(const std::vector<CPiece>& pieces) {
    std::string document;
    for (const CPiece& piece : pieces) {
        document += piece.mIsBlock ? kFence + piece.mLanguage + '\n' + piece.mText + kFence + '\n'
                                   : piece.mText;
    }
    return document;
}

std::vector<std::string> Documents() {
    std::vector<std::string> documents{kRoot + "/README.md"};
    for (const auto& entry : fs::directory_iterator(kRoot + "/docs")) {
        if (entry.path().extension() == ".md") documents.push_back(entry.path().string());
    }
    std::sort(documents.begin() + 1, documents.end());
    return documents;
}

// All files of examples/ in one text.
std::string Examples() {
    std::string all;
    for (const auto& entry : fs::recursive_directory_iterator(kRoot + "/examples")) {
        if (entry.is_regular_file()) all += ReadFile(entry.path().string());
    }
    return all;
}

// Documents show what stands on a terminal, where errors have no mark.
std::string WithoutMarks(const std::string& shown) {
    static const std::regex marks("\\[(stderr|status [0-9]+)\\]\n");
    return std::regex_replace(shown, marks, "");
}

std::string RunAgain(const std::string& console) {
    CTranscript transcript = ReadTranscript(console);
    CHECK(transcript.mPreamble.empty());
    for (CConsoleRun& run : transcript.mRuns) {
        run = {run.mCommand, WithoutMarks(RunCommand(run.mCommand).mShown)};
    }
    return WriteTranscript(transcript);
}

// The commands of a block that ask for the program, in one folder. What builds and installs is run
// by the tests of what is built, and `./run.sh page` by those of the page.
void RunBlock(const std::string& block) {
    static const std::regex ofProgram("\\./run\\.sh (?!page|--version).*");
    std::istringstream lines(block);
    std::string script = "true";
    for (std::string line; std::getline(lines, line);) {
        if (std::regex_match(line, ofProgram)) script += " && " + line.substr(0, line.find("  #"));
    }
    const std::string shown = RunCommand(script).mShown;
    CHECK(shown.find("[st") == shown.npos);
}

bool IsRenewing() {
    return std::getenv("BRINDLE_RENEW_GOLDEN") != nullptr;
}

void CheckOrRenew(const std::string& path, const std::string& text, const std::string& now) {
    INFO(path);
    if (IsRenewing()) {
        if (now != text) std::ofstream(path, std::ios::binary) << now;
    } else {
        CHECK(now == text);
    }
}

TEST_CASE("The documents show what the program does and code that is built") {
    const std::string examples = Examples();
    for (const std::string& path : Documents()) {
        INFO(path);
        const std::string document = ReadFile(path);
        std::vector<CPiece> pieces = Cut(document);
        for (CPiece& piece : pieces) {
            if (!piece.mIsBlock) continue;
            if (piece.mLanguage == "text") {
                CHECK_MESSAGE(piece.mText.find("$ ") == piece.mText.npos,
                              "commands that are not run");
                continue;
            }
            // The tests of the packages for Python and JavaScript run these.
            if (piece.mLanguage == "pycon" || piece.mLanguage == "python") continue;
            if (piece.mLanguage == "js" || piece.mLanguage == "sql") continue;
            INFO(piece.mText);
            if (piece.mLanguage == "sh") {
                RunBlock(piece.mText);
            } else if (piece.mLanguage == "console") {
                piece.mText = RunAgain(piece.mText);
            } else {
                const bool isCode = piece.mLanguage == "cpp" || piece.mLanguage == "c" ||
                                    piece.mLanguage == "cmake";
                CHECK_MESSAGE(isCode, "a block in a language that no test knows");
                CHECK(examples.find(piece.mText) != examples.npos);
            }
        }
        CheckOrRenew(path, document, Join(pieces));
    }
}

TEST_CASE("The pictures are what the program draws") {
    const std::pair<const char*, const char*> pictures[] = {
        {"/docs/pictures/after-youve-gone.svg",
         "brindle analyse --file examples/songs/after-youve-gone.txt --format svg"},
        {"/docs/pictures/auld-lang-syne.svg",
         "brindle analyse examples/songs/auld-lang-syne.txt --format svg"},
        {"/docs/pictures/three-keys.svg",
         "brindle keys 'Dm7 G7 Cmaj7 | Fm7 Bb7 Ebmaj7 | Am7b5 D7 Gm' --beats-per-bar 3 "
         "--format svg"},
    };
    for (const auto& [name, command] : pictures) {
        const std::string path = kRoot + name;
        const std::string now = RunCommand(command).mShown;
        CheckOrRenew(path, fs::exists(path) ? ReadFile(path) : std::string(), now);
    }
}

TEST_CASE("A document is cut into its blocks and joined again without a change") {
    const std::string document = "a\n```console\n$ true\n```\nb\n\n```text\nx\n```\n";
    CHECK(Join(Cut(document)) == document);
    CHECK(Cut(document)[1].mLanguage == "console");
    CHECK(RunAgain("$ echo a\nb\n") == "$ echo a\na\n");
}

}  // namespace
}  // namespace brindle::test
