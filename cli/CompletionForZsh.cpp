// SPDX-License-Identifier: MIT
#include "cli/Completions.h"

#include <fmt/format.h>

#include <algorithm>
#include <string_view>

namespace brindle::cli {
namespace {

std::string FunctionNamed(const std::string& command) {
    std::string name = '_' + command;
    std::replace(name.begin(), name.end(), ' ', '_');
    return name;
}

/// "_brindle_markov_learn"
std::string FunctionOf(const CCommandPage& page) {
    return FunctionNamed(page.mName);
}

/// A text within single quotes, with `special` characters behind a backslash.
std::string ZshQuoted(std::string_view text, std::string_view special) {
    std::string quoted;
    for (const char c : text) {
        if (special.find(c) != special.npos || c == '\\') quoted += '\\';
        quoted += c == '\'' ? "'\\''" : std::string(1, c);
    }
    return quoted;
}

/// What completes a value: "(text json)", "_files", or nothing.
std::string ActionOf(const COptionPage& option) {
    if (!option.mChoices.empty()) return fmt::format("({})", fmt::join(option.mChoices, " "));
    if (option.TakesCommand()) return "_brindle_pages";
    return option.TakesFile() ? "_files" : " ";
}

std::string ArgumentsOf(const COptionPage& option, const std::string& name) {
    const std::string many = option.mIsMany ? "*" : "";
    if (option.mIsArgument) {
        return fmt::format("'{}:{}:{}'", option.mIsMany ? "*" : "", ZshQuoted(name, ":"),
                           ActionOf(option));
    }
    const std::string head = fmt::format("{}{}", many, name);
    const std::string purpose = ZshQuoted(option.mPurpose, "[]:");
    if (option.mValueName.empty()) return fmt::format("'{}[{}]'", head, purpose);
    const char* const joined = name.starts_with("--") ? "=" : "";
    const std::string value = option.mChoices.empty() ? option.mValueName : "choice";
    return fmt::format("'{}{}[{}]:{}:{}'", head, joined, purpose, ZshQuoted(value, ":"),
                       ActionOf(option));
}

std::string Arguments(const CCommandPage& page) {
    std::string text;
    for (const COptionPage& option : page.mOptions) {
        for (const std::string& name : option.mNames) {
            text += " \\\n        " + ArgumentsOf(option, name);
        }
    }
    return text;
}

std::string CommandList(const CCommandPage& page) {
    std::string text;
    for (const CCommandPage& command : page.mCommands) {
        text +=
            fmt::format("        '{}:{}'\n", command.LastName(), ZshQuoted(command.mPurpose, ":"));
    }
    return text;
}

std::string FunctionText(const CCommandPage& page) {
    if (page.mCommands.empty()) {
        return fmt::format("{}() {{\n    _arguments -s{}\n}}\n", FunctionOf(page), Arguments(page));
    }
    return fmt::format(R"({0}() {{
    local state line
    _arguments -C{1} \
        '1: :->command' '*:: :->rest'
    case $state in
        command) {0}_commands ;;
        rest) (( $+functions[{0}_$line[1]] )) && {0}_$line[1] ;;
    esac
}}
{0}_commands() {{
    local -a commands=(
{2}    )
    _describe command commands
}}
)",
                       FunctionOf(page), Arguments(page), CommandList(page));
}

// The function for the other name of a command.
std::string OtherFunctionText(const CCommandPage& page) {
    if (page.mOtherName.empty()) return {};
    return fmt::format("{}() {{ {}; }}\n", FunctionNamed(page.mOtherName), FunctionOf(page));
}

}  // namespace

std::string ZshCompletion(const CCommandPage& program) {
    std::string text = "#compdef brindle\n";
    for (const CCommandPage* const page : AllPages(program)) {
        text += FunctionText(*page) + OtherFunctionText(*page);
    }
    text += R"(_brindle_help() { _arguments '*:COMMAND:_brindle_pages'; }
_brindle_pages() {
    local -a above=(brindle ${words[2,CURRENT-1]:#-*})
    (( $+functions[_${(j:_:)above}_commands] )) && _${(j:_:)above}_commands
}
)";
    // As a file of the function path it is called at once, else it is told what it completes.
    return text +
           "if [ \"$funcstack[1]\" = _brindle ]; then\n    _brindle \"$@\"\nelse\n"
           "    compdef _brindle brindle\nfi\n";
}

}  // namespace brindle::cli
