// SPDX-License-Identifier: MIT
// Help, man pages and completions tell the same commands, options and choices.

#include "tests/support/Transcript.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <regex>
#include <set>
#include <sstream>
#include <string>
#include <vector>

namespace brindle::test {
namespace {

std::string Shown(const std::string& command) {
    return RunCommand(command).mShown;
}

/// What a help tells under its headings.
struct CHelpWords {
    std::vector<std::string> mOptions;
    std::vector<std::string> mCommands;
    std::set<std::string> mChoices;
};

CHelpWords ReadHelp(const std::string& help) {
    static const std::regex option("^  (-[a-z],)?(--[a-z0-9-]+).*");
    static const std::regex choices(
        "^  (?:-[a-z],)?(?:--[a-z-]+|[A-Z]+) ([a-z0-9]+(?:\\|[a-z0-9]+)+).*");
    static const std::regex command("^  ([a-z]+)\\b.*");
    CHelpWords words;
    bool isOfCommands = false;
    std::istringstream lines(help.substr(help.find("Usage: ")));
    for (std::string line; std::getline(lines, line);) {
        std::smatch match;
        if (line.ends_with(':')) isOfCommands = line == "Subcommands:";
        if (std::regex_match(line, match, option)) words.mOptions.push_back(match[2]);
        if (isOfCommands && std::regex_match(line, match, command)) {
            words.mCommands.push_back(match[1]);
        }
        if (!std::regex_match(line, match, choices)) continue;
        std::istringstream list(match[1]);
        for (std::string choice; std::getline(list, choice, '|');) words.mChoices.insert(choice);
    }
    return words;
}

std::string WithoutBackslashes(std::string text) {
    text.erase(std::remove(text.begin(), text.end(), '\\'), text.end());
    return text;
}

/// What follows `start` in a text, up to `end`.
std::string Between(const std::string& text, const std::string& start, const std::string& end) {
    const std::size_t begin = text.find(start);
    if (begin == text.npos) return {};
    return text.substr(begin, text.find(end, begin + start.size()) - begin);
}

struct CCompletions {
    std::string mBash = Shown("brindle completion bash");
    std::string mZsh = Shown("brindle completion zsh");
    std::string mFish = Shown("brindle completion fish");
};

void CheckCommand(const std::string& path, const CCompletions& shells, int& optionCount) {
    INFO("brindle " << path);
    const std::string shown = Shown("brindle " + path + " --help");
    CHECK(Shown("brindle help " + path) == shown);
    const CHelpWords help = ReadHelp(shown);
    const std::string man = WithoutBackslashes(Shown("brindle manual " + path));
    std::string function = "_brindle" + (path.empty() ? "" : '_' + path);
    std::replace(function.begin(), function.end(), ' ', '_');
    const std::string bash = Between(shells.mBash, "\n        '" + path + "') options=", ";;");
    const std::string zsh = Between(shells.mZsh, "\n" + function + "() {", "\n}");
    const std::string zshCommands = Between(shells.mZsh, "\n" + function + "_commands() {", "\n}");
    const std::string fishStart = "complete -c brindle -n \"__brindle_is '" + path + "'\"";
    CHECK_FALSE(help.mOptions.empty());
    for (const std::string& option : help.mOptions) {
        INFO(option);
        ++optionCount;
        CHECK(man.find("fB" + option + "fR") != man.npos);
        CHECK(bash.find(option + ' ') != bash.npos);
        CHECK((zsh.find(option + '[') != zsh.npos || zsh.find(option + "=[") != zsh.npos));
        const std::regex fish("\n" + std::regex_replace(fishStart, std::regex("[\"]"), "\\$&") +
                              "[^\n]* -l " + option.substr(2) + " ");
        CHECK(std::regex_search(shells.mFish, fish));
    }
    for (const std::string& choice : help.mChoices) {
        INFO(choice);
        CHECK(man.find(choice) != man.npos);
        CHECK(zsh.find(choice) != zsh.npos);
    }
    for (const std::string& command : help.mCommands) {
        INFO(command);
        CHECK(bash.find(command + ' ') != bash.npos);
        CHECK(zshCommands.find('\'' + command + ':') != zshCommands.npos);
        CHECK(shells.mFish.find(fishStart + " -a " + command + " -d") != shells.mFish.npos);
        CheckCommand(path.empty() ? command : path + ' ' + command, shells, optionCount);
    }
}

TEST_CASE("Man pages and completions have every command, option and choice of the help") {
    int optionCount = 0;
    CheckCommand("", CCompletions(), optionCount);
    CHECK(optionCount > 100);
}

TEST_CASE("The completion of bash completes commands, options, choices and files") {
    const std::string run =
        "brindle completion bash >b.sh; : >song.txt; source b.sh; compopt() { :; }; "
        "COMP_WORDS=(%); COMP_CWORD=$((${#COMP_WORDS[@]} - 1)); _brindle; "
        "echo \"${COMPREPLY[@]}\"";
    const struct {
        const char* mTyped;
        const char* mShown;
    } rows[] = {
        {"brindle ana", "analyse\n"},
        {"brindle markov ge", "generate\n"},
        {"brindle analyse --ro", "--route\n"},
        {"brindle analyse --route ''", "tonic cadence weights none\n"},
        {"brindle analyse --format = js", "json\n"},
        {"brindle completion z", "zsh\n"},
        {"brindle analyze --ro", "--route\n"},
        {"brindle manual cor", "corpus\n"},
        {"brindle manual markov ge", "generate\n"},
        {"brindle manual --fo", "--folder\n"},
        {"brindle help markov ge", "generate\n"},
        {"brindle manual completion ''", "\n"},
        {"brindle analyse so", "song.txt\n"},
        {"brindle markov learn -o so", "song.txt\n"},
    };
    for (const auto& row : rows) {
        INFO(row.mTyped);
        std::string command = run;
        CHECK(Shown(command.replace(command.find('%'), 1, row.mTyped)) == row.mShown);
    }
}

}  // namespace
}  // namespace brindle::test
