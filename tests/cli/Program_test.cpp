// SPDX-License-Identifier: MIT
// The program as people meet it. tests/cli/golden holds what commands show, byte by byte;
// tools/renew_golden.sh writes it anew for review.

#include "tests/support/Transcript.h"

#include <doctest/doctest.h>
#include <nlohmann/json.hpp>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>

namespace brindle::test {
namespace {

namespace fs = std::filesystem;

const std::string kGolden = BRINDLE_SOURCE_DIR "/tests/cli/golden";

std::vector<std::string> GoldenFiles() {
    std::vector<std::string> files;
    for (const auto& entry : fs::directory_iterator(kGolden)) {
        if (entry.path().extension() == ".txt") files.push_back(entry.path().string());
    }
    std::sort(files.begin(), files.end());
    return files;
}

TEST_CASE("The program shows what the golden files hold") {
    const bool renew = std::getenv("BRINDLE_RENEW_GOLDEN") != nullptr;
    const auto files = GoldenFiles();
    REQUIRE_FALSE(files.empty());
    for (const std::string& file : files) {
        const std::string expected = ReadFile(file);
        CTranscript transcript = ReadTranscript(expected);
        CHECK_MESSAGE(!transcript.mRuns.empty(), file);
        for (CConsoleRun& run : transcript.mRuns) {
            const CConsoleRun now = RunCommand(run.mCommand);
            if (!renew) {
                INFO(file << ": $ " << run.mCommand);
                CHECK(now.mShown == run.mShown);
            }
            run = now;
        }
        if (renew) std::ofstream(file, std::ios::binary) << WriteTranscript(transcript);
    }
}

TEST_CASE("A transcript is read and written without a change, and a difference is seen") {
    const std::string text =
        "Two commands.\n$ brindle --version\n$ echo a; echo b >&2; exit 3\na\n";
    CHECK(WriteTranscript(ReadTranscript(text)) == text);
    const CConsoleRun run = RunCommand("printf a; echo b >&2; exit 3");
    CHECK(run.mShown == "a\n[no end of line]\n[stderr]\nb\n[status 3]\n");
}

TEST_CASE("The native form is what the library writes for a reader of its own") {
    const std::string native = RunCommand("brindle analyse 'C' --format native").mShown;
    CHECK(native.find("{\"HarmSignKeys\":\n[\n{\"Probability\":Undef, \"Position\":") == 0);
    CHECK(native.find("\n]\n}\n[no end of line]\n") != native.npos);
}

TEST_CASE("All JSON of the program is strict") {
    for (const char* command :
         {"brindle analyse --json --symbols native 'C . X C/Q | nochord'",
          "brindle analyse --json --readings 'Dm7 G7 C F#m7b5 B7 Em'",
          "brindle analyse --json --symbols native $'C\\xff\"\\\\<&>\\x01 G'",
          "brindle chord --json --symbols native 'C\"\xff' undef X",
          "brindle scale --json 'Fb mm7'", "brindle key --json 'G# major'",
          "brindle name --json --all-roots C4 E4 --slash-text $'\\xff\"'",
          "brindle copies --json --symbols native $'C\\xff\" F C\\xff\" F'",
          "brindle vector --json --symbols native $'\\xff\"' C",
          "brindle keys --json --symbols native 'C . X C/Q | nochord'",
          "brindle numerals --json 'I V7/ii | ii' --key $'C'", "brindle function --json X --key C",
          "brindle types --json", "brindle net weights --json"}) {
        INFO(std::string(command));
        const auto json = nlohmann::json::parse(RunCommand(command).mShown, nullptr, false);
        CHECK_FALSE(json.is_discarded());
    }
}

}  // namespace
}  // namespace brindle::test
