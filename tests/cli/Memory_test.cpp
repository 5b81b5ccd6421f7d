// SPDX-License-Identifier: MIT
// The program with a memory that runs short at each of its requests in turn: it tells and ends, or
// does all that it does with memory.

#include "tests/support/Transcript.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <string>
#include <vector>

#if defined(BRINDLE_FAILING_MALLOC_LIBRARY)

namespace brindle::test {
namespace {

// The standard output, status and whether a request failed; of standard error what the program does
// not say itself, and whether it says anything.
CConsoleRun RunShort(const std::string& command, long failing, const char* andAllBehind) {
    return RunCommand(fmt::format(
        "export BRINDLE_FAILED_MARK=$PWD/mark; "
        "LD_PRELOAD='{}' BRINDLE_FAILING_MALLOC={}{} '{}' {} 2>errors; status=$?; "
        "grep -v '^brindle: ' errors; grep -q '^brindle: ' errors && echo told; test -e mark && "
        "echo failed; exit $status",
        BRINDLE_FAILING_MALLOC_LIBRARY, failing, andAllBehind, BRINDLE_PROGRAM, command));
}

bool EndsWith(const std::string& text, const std::string& end) {
    return text.size() >= end.size() &&
           text.compare(text.size() - end.size(), end.size(), end) == 0;
}

// Without NDEBUG the JSON library asserts what does not hold in the midst of short memory.
const std::vector<const char*> kCommands{
#ifdef NDEBUG
    "import examples/scores/frere-jacques.musicxml --json",
    "analyse 'Dm7 G7 C' --json",
    "grids import here.gchdb <<<'{\"Libraries\":[]}'",
#endif
    "--version",
};

TEST_CASE("A program whose memory runs short says so and fails, or shows what it should") {
    for (const char* const command : kCommands) {
        const std::string whole = RunShort(command, 0, "").mShown;
        int told = 0;
        for (const char* const andAllBehind : {"", "+"}) {
            // From small to large steps: there are thousands of requests.
            for (long failing = 1;; failing += 1 + failing / 20) {
                const std::string shown = RunShort(command, failing, andAllBehind).mShown;
                if (shown == whole) break;  // nothing failed
                CAPTURE(command);
                CAPTURE(failing);
                CAPTURE(andAllBehind);
                const bool isTold = EndsWith(shown, "told\nfailed\n[status 1]\n");
                if (!isTold) CHECK(shown == whole + "failed\n");
                told += isTold;
            }
        }
        CHECK(told > 20);
    }
}

// The XML library starts and reads with the last requests of a short score.
TEST_CASE("Of short memory for a score tells the program alone, not the XML library") {
    const std::string command = "harmonies - <<<'<score-partwise/>'";
    const auto run = [&](long failing) { return RunShort(command, failing, "").mShown; };
    const std::string whole = run(0);
    long last = 1;
    long none = 2;
    for (; run(none) != whole; none *= 2) last = none;
    while (none - last > 1) {
        const long middle = (none + last) / 2;
        (run(middle) == whole ? none : last) = middle;
    }
    constexpr long kOfXml = 120;
    int told = 0;
    for (long failing = last - kOfXml; failing <= last; ++failing) {
        const std::string shown = run(failing);
        CAPTURE(failing);
        const bool isTold = shown == "told\nfailed\n[status 1]\n";
        if (!isTold) CHECK(shown == whole + "failed\n");
        told += isTold;
    }
    CHECK(told > 20);
}

}  // namespace
}  // namespace brindle::test

#endif
