// SPDX-License-Identifier: MIT
// Help, man pages and completions tell the same commands, options and choices.

#include "tests/support/Transcript.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <cstddef>
#include <map>
#include <regex>
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
    /// Of "--format" or an argument as "SHELL" the words that it takes: "text|json".
    std::map<std::string, std::string> mChoices;
};

CHelpWords ReadHelp(const std::string& help) {
    static const std::regex option("^  (-[a-z],)?(--[a-z0-9-]+).*");
    static const std::regex choices(
        "^  (?:-[a-z],)?(--[a-z-]+|[A-Z]+) ([a-z0-9-]+(?:\\|[a-z0-9-]+)+).*");
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
        if (std::regex_match(line, match, choices)) words.mChoices[match[1]] = match[2];
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

bool Has(const std::string& text, const std::string& part) {
    return text.find(part) != text.npos;
}

struct CCompletions {
    std::string mBash = Shown("brindle completion bash");
    std::string mZsh = Shown("brindle completion zsh");
    std::string mFish = Shown("brindle completion fish");
};

/// What has been compared.
struct CCounts {
    std::size_t mOptions = 0;
    std::size_t mChoices = 0;
};

/// What the man page and the shells have of one command.
struct CPages {
    std::string mPath;
    std::string mMan;
    std::string mBash;
    std::string mBashValues;  // of all commands
    std::string mZsh;
    std::string mZshCommands;
    std::string mFish;
    std::string mFishStart;
};

CPages PagesOf(const std::string& path, const CCompletions& shells) {
    std::string function = "_brindle" + (path.empty() ? "" : '_' + path);
    std::replace(function.begin(), function.end(), ' ', '_');
    return {path,
            WithoutBackslashes(Shown("brindle manual " + path)),
            Between(shells.mBash, "\n        '" + path + "') options=", ";;"),
            shells.mBash,
            Between(shells.mZsh, "\n" + function + "() {", "\n}"),
            Between(shells.mZsh, "\n" + function + "_commands() {", "\n}"),
            shells.mFish,
            "\ncomplete -c brindle -n \"__brindle_is '" + path + "'\""};
}

void CheckOption(const CPages& pages, const std::string& option) {
    INFO(option);
    CHECK(Has(pages.mMan, "fB" + option + "fR"));
    CHECK(Has(pages.mBash, option + ' '));
    CHECK((Has(pages.mZsh, option + '[') || Has(pages.mZsh, option + "=[")));
    const std::regex fish(std::regex_replace(pages.mFishStart, std::regex("[\"]"), "\\$&") +
                          "[^\n]* -l " + option.substr(2) + " ");
    CHECK(std::regex_search(pages.mFish, fish));
}

void CheckChoices(const CPages& pages, const std::string& name, const std::string& choices) {
    INFO(name);
    const std::string words = std::regex_replace(choices, std::regex("\\|"), " ");
    CHECK(Has(pages.mMan, name + "fR fI" + choices + "fR"));
    if (name.front() != '-') {
        CHECK(Has(pages.mBash, " words='" + words + " '"));
        CHECK(Has(pages.mZsh, "':" + name + ":(" + words + ")'"));
        CHECK(Has(pages.mFish, pages.mFishStart + " -a '" + words + "' -d "));
        return;
    }
    CHECK(Has(pages.mBashValues,
              " '" + pages.mPath + ' ' + name + "') _brindle_words '" + words + "';"));
    CHECK(Has(Between(pages.mZsh, name + "=[", "\n"), "]:choice:(" + words + ")'"));
    const std::string option = " -l " + name.substr(2);
    CHECK(Has(pages.mFish, pages.mFishStart + option + " -x -a '" + words + "' -d "));
}

void CheckCommand(const std::string& path, const CCompletions& shells, CCounts& counts) {
    INFO("brindle " << path);
    const std::string shown = Shown("brindle " + path + " --help");
    CHECK(Shown("brindle help " + path) == shown);
    const CHelpWords help = ReadHelp(shown);
    const CPages pages = PagesOf(path, shells);
    CHECK_FALSE(help.mOptions.empty());
    for (const std::string& option : help.mOptions) CheckOption(pages, option);
    for (const auto& choice : help.mChoices) CheckChoices(pages, choice.first, choice.second);
    counts.mOptions += help.mOptions.size();
    counts.mChoices += help.mChoices.size();
    for (const std::string& command : help.mCommands) {
        INFO(command);
        CHECK(Has(pages.mBash, command + ' '));
        CHECK(Has(pages.mZshCommands, '\'' + command + ':'));
        CHECK(Has(pages.mFish, pages.mFishStart + " -a " + command + " -d"));
        CheckCommand(path.empty() ? command : path + ' ' + command, shells, counts);
    }
}

TEST_CASE("Man pages and completions have every command, option and choice of the help") {
    CCounts counts;
    CheckCommand("", CCompletions(), counts);
    CHECK(counts.mOptions > 100);
    CHECK(counts.mChoices > 30);
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
        {"brindle markov score built-in so", "song.txt\n"},
        {"brindle chord so", "song.txt\n"},
    };
    for (const auto& row : rows) {
        INFO(row.mTyped);
        std::string command = run;
        CHECK(Shown(command.replace(command.find('%'), 1, row.mTyped)) == row.mShown);
    }
}

}  // namespace
}  // namespace brindle::test
