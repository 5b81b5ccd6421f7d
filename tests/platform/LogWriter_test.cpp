// SPDX-License-Identifier: MIT
#include "brindle/platform/LogWriter.h"
#include "brindle/platform/AtomicFile.h"

#include <doctest/doctest.h>

#include <unistd.h>

#include <filesystem>
#include <regex>
#include <string>

using namespace brindle;

TEST_CASE("A log begins with a heading and holds an entry a line") {
    const auto path = std::filesystem::temp_directory_path() /
                      ("brindle_log_test_" + std::to_string(getpid()) + ".log");
    LogWriter log;
    log.append_plain("to no file");
    REQUIRE(log.open(path.string()));
    log.append("loaded");
    log.append_plain("plain");
    log.close();
    REQUIRE(log.open_for_append(path.string()));
    log.append_timestamp();
    log.close();
    const std::string time = "[A-Z][a-z]{2} [A-Z][a-z]{2} [ 0-9]\\d \\d\\d:\\d\\d:\\d\\d \\d{4}";
    const std::regex wanted("-{64}\nNew log created on " + time + "\n-{64}\n" + time +
                            "  \t{9}\\| loaded\nplain\n" + time + "\n");
    CHECK(std::regex_match(ReadWholeFile(path).value(), wanted));
    std::filesystem::remove(path);
    CHECK_FALSE(log.open("/nowhere/at/all.log"));
}
