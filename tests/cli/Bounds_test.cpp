// SPDX-License-Identifier: MIT
// What hostile and long inputs may take of the machine.

#include "tests/support/ScratchFolder.h"

#include "brindle/platform/AtomicFile.h"

#include <doctest/doctest.h>
#include <fcntl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <functional>
#include <string>
#include <utility>
#include <vector>

// Where memory is watched it takes more.
#if defined(BRINDLE_FAILING_MALLOC_LIBRARY)

namespace brindle::test {
namespace {

std::string Joined(int count, const std::function<std::string(int)>& piece) {
    std::string text;
    for (int n = 0; n < count; ++n) text += piece(n);
    return text;
}

std::string Score(const std::string& measures) {
    return "<score-partwise><part-list><score-part id='P1'/></part-list><part id='P1'>" + measures +
           "</part></score-partwise>";
}

std::string Measure(const std::string& begin, const std::string& end) {
    return "<measure>" + begin +
           "<note><pitch><step>C</step><octave>4</octave></pitch><duration>4</duration></note>" +
           end + "</measure>";
}

std::string Repeated64Times(const std::string& harmonies) {
    return Score(Measure("<barline><repeat direction='forward'/></barline>" + harmonies,
                         "<barline><repeat direction='backward' times='64'/></barline>"));
}

std::string Harmony(const std::string& kind) {
    return "<harmony><root><root-step>C</root-step></root><kind>" + kind + "</kind></harmony>";
}

struct CUse {
    int mStatus;
    long mMegabytes;
};

/// Runs the program and throws away what it shows.
CUse Use(std::vector<std::string> words) {
    std::vector<char*> arguments{const_cast<char*>(BRINDLE_PROGRAM)};
    for (std::string& word : words) arguments.push_back(word.data());
    arguments.push_back(nullptr);
    const pid_t child = fork();
    if (child == 0) {
        const int nowhere = open("/dev/null", O_WRONLY);
        dup2(nowhere, STDOUT_FILENO);
        dup2(nowhere, STDERR_FILENO);
        execv(BRINDLE_PROGRAM, arguments.data());
        _exit(127);
    }
    REQUIRE(child > 0);
    int status = 0;
    rusage usage{};
    REQUIRE(wait4(child, &status, 0, &usage) == child);
    return {WIFEXITED(status) ? WEXITSTATUS(status) : -1, usage.ru_maxrss / 1024};
}

TEST_CASE("Songs that jump, repeat or go on without end take a bounded memory") {
    const CScratchFolder folder;
    const auto songOfChords = [](int count) {
        return Joined(count, [](int n) { return std::string(n % 3 == 0 ? "Dm7 " : "G7 "); });
    };
    const std::string longKind(1'000, 'x');
    struct CRow {
        const char* mSubject;
        std::string mInput;
        std::vector<std::string> mWords;
        int mStatus;
        long mMegabytes;
    };
    const CRow rows[] = {
        {"each of 1400 measures goes back to the begin",
         Score(Joined(1'400,
                      [](int) { return Measure("<sound dacapo='yes'/>" + Harmony("major"), ""); })),
         {"harmonies", "--json"},
         1,
         60},
        {"15,500 harmonies in a measure that is played 64 times",
         Repeated64Times(Joined(15'500, [](int) { return Harmony("major"); })),
         {"harmonies", "--json"},
         1,
         60},
        {"1500 harmonies with long words in such a measure",
         Repeated64Times(Joined(1'500, [&](int) { return Harmony(longKind); })),
         {"harmonies", "--json"},
         0,
         110},
        {"100,000 typed chords", songOfChords(100'000), {"analyse", "--json"}, 0, 260},
        {"their readings", songOfChords(100'000), {"analyse", "--json", "--readings"}, 0, 320},
    };
    for (const CRow& row : rows) {
        INFO(std::string(row.mSubject));
        const std::string file = folder.File("input");
        REQUIRE(WriteFileAtomically(file, row.mInput));
        std::vector<std::string> words = row.mWords;
        words.push_back(file);
        const CUse use = Use(std::move(words));
        CHECK(use.mStatus == row.mStatus);
        CHECK(use.mMegabytes < row.mMegabytes);
    }
}

}  // namespace
}  // namespace brindle::test

#endif
