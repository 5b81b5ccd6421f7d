// SPDX-License-Identifier: MIT
#pragma once

#include "cli/CommandPage.h"
#include "cli/Output.h"

#include <cstdint>
#include <functional>
#include <list>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace CLI {
class App;
class Option;
}  // namespace CLI

namespace brindle::cli {

/// What a command is called, what it does, and calls of it that work.
struct CCommandHelp {
    const char* mName;
    const char* mPurpose;
    /// They stand at the top of the help; null for those of the command above.
    const char* mExamples;
};

/// An option, a flag or an argument of a command. It lives as long as the command.
class COption {
public:
    COption& Required();
    /// Values from `least` to `most`, both of the type of the value.
    COption& InRange(int least, int most);
    COption& InRange(std::uint64_t least, std::uint64_t most);
    COption& InRange(double least, double most);
    /// Cannot be told together with another option, which is there already.
    COption& Excludes(const std::string& name);
    /// The heading in the help under which it stands.
    COption& InGroup(const std::string& heading);

private:
    friend class CCommand;
    explicit COption(CLI::Option& option) : mOption(&option) {}

    CLI::Option* mOption;
};

/// The program or one of its commands: what it takes from the command line and what it then does.
/// Whatever is taken is written to a value of the caller, which is left as it is when the command
/// line does not tell, and has to live until the command has been called.
///
/// The library for command lines is included by CCommand.cpp alone, since it takes long to compile.
class CCommand {
public:
    /// The program.
    CCommand(const CCommandHelp& help, const std::string& version);

    /// Adds a command, of which the command line then has to tell one.
    CCommand& AddCommand(const CCommandHelp& help);

    /// Another name of this command, which the help tells beside its own.
    void AlsoCalled(const std::string& name);

    /// What is told without a name: one word, or several.
    COption AddArgument(const std::string& name, std::string& word, const std::string& purpose);
    COption AddArgument(const std::string& name, std::vector<std::string>& words,
                        const std::string& purpose);

    /// An option that can be told several times, with one value each. `names` and `valueName` are
    /// those of AddOption.
    COption AddListOption(const std::string& names, const std::string& valueName,
                          std::vector<std::string>& values, const std::string& purpose);

    /// `names` are "--name" or "-n,--name", `valueName` stands for the value in the help. The types
    /// of values are those for which CCommand.cpp makes it.
    template <typename TValue>
    COption AddOption(const std::string& names, const std::string& valueName, TValue& value,
                      const std::string& purpose);

    /// An option that takes one of a few words; `value` holds the one that is taken if none is
    /// told.
    COption AddChoice(const std::string& name, std::string& value,
                      const std::vector<std::string>& choices, const std::string& purpose);

    /// An argument that has to be one of a few words.
    COption AddChoiceArgument(const std::string& name, std::string& word,
                              const std::vector<std::string>& choices, const std::string& purpose);

    COption AddFlag(const std::string& name, bool& value, const std::string& purpose);

    /// One that has been added.
    [[nodiscard]] COption Option(const std::string& name) const;

    /// What happens when the command line asks for this command.
    void OnCall(std::function<TStatus()> call);

    /// What has been declared so far, of this command and those below it.
    [[nodiscard]] CCommandPage Page() const;

    /// Of the program: reads the command line and calls the command that it asks for. Help is
    /// printed, what is wrong with the command line told. Whatever the command throws goes on.
    [[nodiscard]] TStatus Run(int argc, const char* const* argv);

private:
    CCommand(CCommand& above, const CCommandHelp& help);

    std::shared_ptr<CLI::App> mApp;
    /// As it is called, with the names of the commands above.
    std::string mName;
    std::string mOtherName;
    std::string mExamples;
    std::map<const CLI::Option*, std::vector<std::string>> mChoices;
    /// How the command that is called ends; one for the program and all its commands.
    std::shared_ptr<TStatus> mStatus;
    std::list<CCommand> mCommands;
};

}  // namespace brindle::cli
