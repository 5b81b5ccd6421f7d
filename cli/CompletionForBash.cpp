// SPDX-License-Identifier: MIT
#include "cli/Completions.h"

#include <fmt/format.h>

#include <algorithm>

namespace brindle::cli {
namespace {

/// "'markov learn -o'|'markov learn --output'"
std::string OptionPatterns(const CCommandPage& page, const COptionPage& option) {
    std::string patterns;
    for (const std::string& name : option.mNames) {
        patterns += fmt::format("{}'{} {}'", patterns.empty() ? "" : "|", page.WordsBelow(), name);
    }
    return patterns;
}

std::string ValueCases(const CCommandPage& program) {
    std::string text;
    for (const CCommandPage* const page : AllPages(program)) {
        for (const COptionPage& option : page->mOptions) {
            if (option.mIsArgument || option.mValueName.empty()) continue;
            const std::string values = fmt::format("{}", fmt::join(option.mChoices, " "));
            text += fmt::format("        {}) {} ;;\n", OptionPatterns(*page, option),
                                option.TakesFile() ? "_brindle_files; return"
                                                   : "_brindle_words '" + values + "'; return");
        }
    }
    return text;
}

bool TakesFileArgument(const CCommandPage& page) {
    return std::any_of(page.mOptions.begin(), page.mOptions.end(), [](const COptionPage& option) {
        return option.mIsArgument && option.TakesFile();
    });
}

std::string ArgumentWords(const CCommandPage& page) {
    std::string words;
    for (const CCommandPage& command : page.mCommands) words += command.LastName() + ' ';
    for (const COptionPage& option : page.mOptions) {
        if (option.mIsArgument) words += fmt::format("{} ", fmt::join(option.mChoices, " "));
    }
    return words;
}

std::string OptionWords(const CCommandPage& page) {
    std::string words;
    for (const COptionPage& option : page.mOptions) {
        if (!option.mIsArgument) words += fmt::format("{} ", fmt::join(option.mNames, " "));
    }
    return words;
}

std::string WordCases(const CCommandPage& program) {
    std::string text;
    for (const CCommandPage* const page : AllPages(program)) {
        text += fmt::format("        '{}') options='{}' words='{}' files={} ;;\n",
                            page->WordsBelow(), OptionWords(*page), ArgumentWords(*page),
                            TakesFileArgument(*page) ? "yes" : "");
    }
    return text;
}

std::string CommandPatterns(const CCommandPage& program) {
    std::string patterns;
    for (const CCommandPage* const page : AllPages(program)) {
        if (page == &program) continue;
        patterns += fmt::format("{}'{}'", patterns.empty() ? "" : "|", page->WordsBelow());
    }
    return patterns;
}

}  // namespace

std::string BashCompletion(const CCommandPage& program) {
    std::string text = R"(# bash completion for brindle
_brindle_words() { mapfile -t COMPREPLY < <(compgen -W "$1" -- "$cur"); }
_brindle_files() {
    compopt -o filenames
    mapfile -t COMPREPLY < <(compgen -f -- "$cur")
}
_brindle() {
    local cur=${COMP_WORDS[COMP_CWORD]} prev=${COMP_WORDS[COMP_CWORD - 1]}
    local path= next i options= words= files=
    # The shell takes --format=json for three words.
    if [ "$cur" = "=" ]; then
        cur=
    elif [ "$prev" = "=" ]; then
        prev=${COMP_WORDS[COMP_CWORD - 2]}
    fi
    for ((i = 1; i < COMP_CWORD; ++i)); do
        next="${path:+$path }${COMP_WORDS[i]}"
        case "$next" in
            )" + CommandPatterns(program) +
                       R"() path=$next ;;
        esac
    done
    case "$path $prev" in
)" + ValueCases(program) +
                       R"(    esac
    case "$path" in
)" + WordCases(program) +
                       R"(    esac
    case "$cur" in
        -*) _brindle_words "$options" ;;
        *)
            if [ -n "$files" ]; then _brindle_files; else _brindle_words "$words"; fi ;;
    esac
}
complete -F _brindle brindle
)";
    return text;
}

}  // namespace brindle::cli
