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
        text += fmt::format("{} -a {} -d {}\n", start, command.LastName(),
                            FishQuoted(command.mPurpose));
    }
    return text;
}

std::string CommandCases(const CCommandPage& program) {
    std::string text;
    for (const CCommandPage* const page : AllPages(program)) {
        if (page != &program) text += ' ' + FishQuoted(page->WordsBelow());
    }
    return text;
}

}  // namespace

std::string FishCompletion(const CCommandPage& program) {
    std::string text = R"(# fish completion for brindle
function __brindle_is
    set -l path
    for word in (commandline -opc)[2..-1]
        set -l next (string join ' ' -- $path $word)
        switch "$next"
            case)" + CommandCases(program) +
                       R"(
                set path $next
        end
    end
    test "$path" = "$argv[1]"
end
complete -c brindle -f
)";
    for (const CCommandPage* const page : AllPages(program)) text += FishLinesOf(*page);
    return text;
}

}  // namespace brindle::cli
