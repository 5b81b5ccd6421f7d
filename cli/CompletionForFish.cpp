// SPDX-License-Identifier: MIT
#include "cli/Completions.h"

#include <fmt/format.h>

#include <string_view>

namespace brindle::cli {
namespace {

std::string FishQuoted(std::string_view text) {
    std::string quoted = "'";
    for (const char c : text) {
        if (c == '\'' || c == '\\') quoted += '\\';
        quoted += c;
    }
    return quoted + '\'';
}

std::string OptionLine(const std::string& start, const COptionPage& option) {
    std::string line = start;
    for (const std::string& name : option.mNames) {
        if (option.mIsArgument) break;
        const bool isLong = name.starts_with("--");
        line += fmt::format(" -{} {}", isLong ? 'l' : 's', name.substr(isLong ? 2 : 1));
    }
    const bool hasValue = option.mIsArgument || !option.mValueName.empty();
    if (hasValue) line += option.TakesFile() ? " -r -F" : option.mIsArgument ? "" : " -x";
    if (!option.mChoices.empty()) {
        line += " -a " + FishQuoted(fmt::format("{}", fmt::join(option.mChoices, " ")));
    }
    return line + " -d " + FishQuoted(option.mPurpose) + '\n';
}

std::string FishLinesOf(const CCommandPage& page) {
    const std::string start =
        fmt::format("complete -c brindle -n \"__brindle_is '{}'\"", page.WordsBelow());
    std::string text;
    for (const COptionPage& option : page.mOptions) {
        // Only of arguments that are files or choices is there anything to say.
        if (option.mIsArgument && option.mChoices.empty()) {
            if (option.TakesFile()) text += start + " -F\n";
        } else {
            text += OptionLine(start, option);
        }
    }
    for (const CCommandPage& command : page.mCommands) {
        const std::string shown =
            fmt::format(" -a {} -d {}\n", command.LastName(), FishQuoted(command.mPurpose));
        text += start + shown;
        text +=
            fmt::format("complete -c brindle -n \"__brindle_describes '{}'\"", page.WordsBelow()) +
            shown;
    }
    return text;
}

// The steps from command to command, also by other names.
std::string FishPathCases(const CCommandPage& program) {
    std::string names;
    std::string text;
    for (const CCommandPage* const page : AllPages(program)) {
        if (page == &program) continue;
        names += ' ' + FishQuoted(page->WordsBelow());
        if (page->mOtherName.empty()) continue;
        text += fmt::format("            case {}\n                set path {}\n",
                            FishQuoted(page->OtherWordsBelow()), FishQuoted(page->WordsBelow()));
    }
    return text + "            case" + names + "\n                set path $next\n";
}

// The commands whose arguments are the words of another.
std::string DescribingCommands(const CCommandPage& program) {
    std::string names;
    for (const CCommandPage& page : program.mCommands) {
        if (page.TakesCommand()) names += ' ' + page.LastName();
    }
    return names;
}

}  // namespace

std::string FishCompletion(const CCommandPage& program) {
    std::string text = R"(# fish completion for brindle
function __brindle_path
    set -l path
    for word in $argv
        set -l next (string join ' ' -- $path $word)
        switch "$next"
)" + FishPathCases(program) +
                       R"(        end
    end
    echo "$path"
end
function __brindle_is
    set -l words (commandline -opc)
    test (__brindle_path $words[2..]) = "$argv[1]"
end
function __brindle_describes
    set -l words (commandline -opc)
    contains -- "$words[2]")" +
                       DescribingCommands(program) + R"(
    and test (__brindle_path $words[3..]) = "$argv[1]"
end
complete -c brindle -f
)";
    for (const CCommandPage* const page : AllPages(program)) text += FishLinesOf(*page);
    return text;
}

}  // namespace brindle::cli
