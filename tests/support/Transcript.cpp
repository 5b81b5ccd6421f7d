// SPDX-License-Identifier: MIT
#include "tests/support/Transcript.h"

#include "tests/support/ScratchFolder.h"

#include <doctest/doctest.h>
#include <fmt/format.h>
#include <sys/wait.h>

#include <cstdlib>
#include <fstream>
#include <iterator>
#include <sstream>

namespace brindle::test {
namespace {

constexpr std::string_view kPrompt = "$ ";

// Standard input is empty, and nothing of the caller's terminal or language gets in.
std::string Script(const CScratchFolder& scratch, const std::string& command) {
    constexpr const char* setUp = R"(
mkdir '{0}/here' && cd '{0}/here' && ln -s '{1}/examples' '{1}/tests/data/leadsheets' . || exit 99
unset NO_COLOR
export TERM=xterm LC_ALL=C
function brindle {{ '{2}' "$@"; }}
function ./run.sh {{ '{2}' "$@"; }}
{{ {3}
}} </dev/null >'{0}/out' 2>'{0}/err'
)";
    return fmt::format(fmt::runtime(setUp), scratch.Path(), BRINDLE_SOURCE_DIR, BRINDLE_PROGRAM,
                       command);
}

void AppendLines(std::string& shown, const std::string& text) {
    shown += text;
    if (!text.empty() && text.back() != '\n') shown += "\n[no end of line]\n";
}

}  // namespace

std::string ReadFile(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    INFO(path);
    REQUIRE(file.is_open());
    return {std::istreambuf_iterator<char>(file), {}};
}

CTranscript ReadTranscript(std::string_view text) {
    CTranscript transcript;
    std::istringstream lines{std::string(text)};
    for (std::string line; std::getline(lines, line);) {
        if (line.compare(0, kPrompt.size(), kPrompt) == 0) {
            transcript.mRuns.push_back({line.substr(kPrompt.size()), {}});
            continue;
        }
        std::string& part =
            transcript.mRuns.empty() ? transcript.mPreamble : transcript.mRuns.back().mShown;
        part += line + '\n';
    }
    return transcript;
}

std::string WriteTranscript(const CTranscript& transcript) {
    std::string text = transcript.mPreamble;
    for (const CConsoleRun& run : transcript.mRuns) {
        text += std::string(kPrompt) + run.mCommand + '\n' + run.mShown;
    }
    return text;
}

CConsoleRun RunCommand(const std::string& command) {
    const CScratchFolder scratch;
    std::ofstream(scratch.File("script")) << Script(scratch, command);
    const int outcome = std::system(("bash '" + scratch.File("script") + "'").c_str());

    CConsoleRun run{command, {}};
    AppendLines(run.mShown, ReadFile(scratch.File("out")));
    const std::string errors = ReadFile(scratch.File("err"));
    if (!errors.empty()) {
        run.mShown += "[stderr]\n";
        AppendLines(run.mShown, errors);
    }
    const int status = WIFEXITED(outcome) ? WEXITSTATUS(outcome) : 128 + WTERMSIG(outcome);
    if (status != 0) run.mShown += "[status " + std::to_string(status) + "]\n";
    return run;
}

}  // namespace brindle::test
