// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

namespace brindle::cli {

/// An option, a flag or an argument of a command as it was declared.
struct COptionPage {
    /// "-o" and "--output"; of an argument its name alone, as in TEXT.
    std::vector<std::string> mNames;
    /// What stands for the value, as in PATH; empty for flags and arguments.
    std::string mValueName;
    std::string mPurpose;
    /// The words that it takes, empty if it takes others.
    std::vector<std::string> mChoices;
    /// The heading of its group in the help; empty for the usual one.
    std::string mGroup;
    bool mIsArgument = false;
    bool mIsRequired = false;
    /// Whether it can be told more than once.
    bool mIsMany = false;

    /// Whether the value may be the name of a file: of an option by the word that stands for it.
    [[nodiscard]] bool TakesFile() const;
    /// Whether the value is the words of a command of the program.
    [[nodiscard]] bool TakesCommand() const;
};

/// A command as it was declared, from which its man page and the completions of shells are made, so
/// that they have all that --help has.
struct CCommandPage {
    /// As it is called, "brindle markov learn".
    std::string mName;
    /// Another name that it has, "brindle analyze"; empty for none.
    std::string mOtherName;
    std::string mPurpose;
    /// Calls that work, one a line, and behind a blank line what there is to know.
    std::string mExamples;
    /// In the order of the help.
    std::vector<COptionPage> mOptions;
    std::vector<CCommandPage> mCommands;

    /// The last word of the name, "learn".
    [[nodiscard]] std::string LastName() const;
    /// The words behind the program's, "markov learn"; empty for the program.
    [[nodiscard]] std::string WordsBelow() const;
    /// The same of its other name; empty for none.
    [[nodiscard]] std::string OtherWordsBelow() const;
    /// Whether an argument takes the words of a command.
    [[nodiscard]] bool TakesCommand() const;
};

/// A command and all that are below it, each before those that are below it.
[[nodiscard]] std::vector<const CCommandPage*> AllPages(const CCommandPage& page);

}  // namespace brindle::cli
