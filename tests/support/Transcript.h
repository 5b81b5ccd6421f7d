// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace brindle::test {

/// A command line and all that it shows.
struct CConsoleRun {
    std::string mCommand;
    /// The standard output; behind it, if there is any, the line "[stderr]" and the standard error;
    /// behind that the line "[status N]" unless N is 0. An output whose last line does not end is
    /// followed by the line "[no end of line]".
    std::string mShown;
};

/// Commands with what they show, as a terminal would: each command on a line behind "$ ".
struct CTranscript {
    /// What stands before the first command.
    std::string mPreamble;
    std::vector<CConsoleRun> mRuns;
};

[[nodiscard]] CTranscript ReadTranscript(std::string_view text);
[[nodiscard]] std::string WriteTranscript(const CTranscript& transcript);

/// Runs the command in a shell. `brindle` and `./run.sh` are the program of this build, and the
/// folder that it runs in holds the examples and the lead sheets and else nothing.
[[nodiscard]] CConsoleRun RunCommand(const std::string& command);

/// The whole file; fails the test if it is not there.
[[nodiscard]] std::string ReadFile(const std::string& path);

}  // namespace brindle::test
