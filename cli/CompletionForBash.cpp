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

std::string CommandWords(const CCommandPage& page) {
    std::string words;
    for (const CCommandPage& command : page.mCommands) words += command.LastName() + ' ';
    return words;
}

std::string ArgumentWords(const CCommandPage& page) {
    std::string words;
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
        text += fmt::format("        '{}') options='{}' commands='{}' words='{}' files={} ;;\n",
                            page->WordsBelow(), OptionWords(*page), CommandWords(*page),
                            ArgumentWords(*page), TakesFileArgument(*page) ? "yes" : "");
    }
    return text;
}

// The steps from command to command, also by other names.
std::string BashPathCases(const CCommandPage& program) {
    std::string patterns;
    std::string text;
    for (const CCommandPage* const page : AllPages(program)) {
        if (page == &program) continue;
        const std::string other = page->OtherWordsBelow();
        patterns += fmt::format("{}'{}'", patterns.empty() ? "" : "|", page->WordsBelow());
        if (other.empty()) continue;
        text += fmt::format("            '{}') path='{}' ;;\n", other, page->WordsBelow());
    }
    return fmt::format("{}            {}) path=$next ;;\n", text, patterns);
}

// Of the commands whose arguments are the words of another.
std::string DescribingPatterns(const CCommandPage& program) {
    std::string patterns = "help";
    for (const CCommandPage& page : program.mCommands) {
        if (page.TakesCommand()) patterns += '|' + page.LastName();
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
# Sets path to the command that the words from the first on lead to, and what may follow it.
_brindle_path() {
    local i next
    path=
    for ((i = $1; i < COMP_CWORD; ++i)); do
        next="${path:+$path }${COMP_WORDS[i]}"
        case "$next" in
)" + BashPathCases(program) +
                       R"(        esac
    done
    case "$path" in
)" + WordCases(program) +
                       R"(    esac
}
_brindle() {
    local cur=${COMP_WORDS[COMP_CWORD]} prev=${COMP_WORDS[COMP_CWORD - 1]}
    local path options commands words files
    # The shell takes --format=json for three words.
    if [ "$cur" = "=" ]; then
        cur=
    elif [ "$prev" = "=" ]; then
        prev=${COMP_WORDS[COMP_CWORD - 2]}
    fi
    _brindle_path 1
    case "$path $prev" in
)" + ValueCases(program) +
                       R"(    esac
    case "$cur" in
        -*) _brindle_words "$options"; return ;;
    esac
    case "${COMP_WORDS[1]}" in
        )" + DescribingPatterns(program) +
                       R"()
            if [ "$COMP_CWORD" -gt 1 ]; then
                _brindle_path 2
                _brindle_words "$commands"
                return
            fi ;;
    esac
    if [ -n "$files" ]; then _brindle_files; else _brindle_words "$commands$words"; fi
}
complete -F _brindle brindle
)";
    return text;
}

}  // namespace brindle::cli
