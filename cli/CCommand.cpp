// SPDX-License-Identifier: MIT
#include "cli/CCommand.h"

#include <fmt/format.h>

#include <CLI/CLI.hpp>
#include <optional>
#include <sstream>
#include <utility>

namespace brindle::cli {
namespace {

class CExamplesFirst : public CLI::Formatter {
public:
    explicit CExamplesFirst(std::string examples) : mExamples(std::move(examples)) {
        column_width(34);
    }

    std::string make_help(const CLI::App* app, std::string name,
                          CLI::AppFormatMode mode) const override {
        std::string help = CLI::Formatter::make_help(app, std::move(name), mode);
        if (mode == CLI::AppFormatMode::Sub) return help;
        return "Examples:\n" + mExamples + "\n" + help;
    }

private:
    std::string mExamples;
};

void ShowExamplesFirst(CLI::App& app, const char* examples) {
    if (examples != nullptr) app.formatter(std::make_shared<CExamplesFirst>(examples));
}

std::string SubcommandNames(const CLI::App& program) {
    std::vector<std::string> names;
    for (const CLI::App* const command : program.get_subcommands({})) {
        names.push_back(command->get_name());
    }
    return fmt::format("{}", fmt::join(names, ", "));
}

// CLI11 asks for help and version by exceptions, too; these end well.
TStatus Report(const CLI::App& program, const CLI::ParseError& error, const char* firstWord) {
    if (error.get_exit_code() == static_cast<int>(CLI::ExitCodes::Success)) {
        std::ostringstream shown;
        program.exit(error, shown, shown);
        return Print(shown.str());
    }
    const std::vector<CLI::App*> commands = program.get_subcommands();
    if (!commands.empty()) {
        return Fail(TStatus::BadUsage,
                    fmt::format("{}; see brindle {} --help", Printable(error.what()),
                                commands.front()->get_name()));
    }
    if (firstWord == nullptr || *firstWord == '-') {
        return Fail(TStatus::BadUsage, fmt::format("{}; see brindle --help", error.what()));
    }
    return Fail(TStatus::BadUsage, fmt::format("{} is no subcommand, there are: {}",
                                               Printable(firstWord), SubcommandNames(program)));
}

}  // namespace

COption& COption::Required() {
    mOption->required();
    return *this;
}

COption& COption::InRange(int least, int most) {
    mOption->check(CLI::Range(least, most));
    return *this;
}

COption& COption::InRange(std::uint64_t least, std::uint64_t most) {
    mOption->check(CLI::Range(least, most));
    return *this;
}

COption& COption::InRange(double least, double most) {
    mOption->check(CLI::Range(least, most));
    return *this;
}

COption& COption::Excludes(const std::string& name) {
    // The text keeps the help from listing what is excluded.
    mOption->excludes(name)->option_text(" ");
    return *this;
}

COption& COption::InGroup(const std::string& heading) {
    mOption->group(heading);
    return *this;
}

CCommand::CCommand(const CCommandHelp& help, const std::string& version)
    : mApp(std::make_shared<CLI::App>(help.mPurpose, help.mName)),
      mStatus(std::make_shared<TStatus>(TStatus::Success)) {
    mApp->set_version_flag("--version", version);
    ShowExamplesFirst(*mApp, help.mExamples);
}

CCommand::CCommand(CCommand& above, const CCommandHelp& help)
    : mApp(above.mApp->get_subcommand_ptr(above.mApp->add_subcommand(help.mName, help.mPurpose))),
      mStatus(above.mStatus) {
    ShowExamplesFirst(*mApp, help.mExamples);
}

CCommand& CCommand::AddCommand(const CCommandHelp& help) {
    mApp->require_subcommand(1);
    mCommands.push_back(CCommand(*this, help));
    return mCommands.back();
}

COption CCommand::AddArgument(const std::string& name, std::string& word,
                              const std::string& purpose) {
    return AddOption(name, " ", word, purpose);
}

COption CCommand::AddArgument(const std::string& name, std::vector<std::string>& words,
                              const std::string& purpose) {
    return COption(*mApp->add_option(name, words, purpose)->option_text("..."));
}

template <typename TValue>
COption CCommand::AddOption(const std::string& names, const std::string& valueName, TValue& value,
                            const std::string& purpose) {
    return COption(*mApp->add_option(names, value, purpose)->option_text(valueName));
}

template COption CCommand::AddOption(const std::string&, const std::string&, std::string&,
                                     const std::string&);
template COption CCommand::AddOption(const std::string&, const std::string&, int&,
                                     const std::string&);
template COption CCommand::AddOption(const std::string&, const std::string&, std::uint64_t&,
                                     const std::string&);
template COption CCommand::AddOption(const std::string&, const std::string&, double&,
                                     const std::string&);
template COption CCommand::AddOption(const std::string&, const std::string&,
                                     std::optional<std::uint64_t>&, const std::string&);
template COption CCommand::AddOption(const std::string&, const std::string&,
                                     std::optional<std::string>&, const std::string&);

COption CCommand::AddChoice(const std::string& name, std::string& value,
                            const std::vector<std::string>& choices, const std::string& purpose) {
    const std::string defaultValue = " (default: " + value + ")";
    const COption option =
        AddOption(name, fmt::format("{}", fmt::join(choices, "|")), value, purpose + defaultValue);
    option.mOption->check(CLI::IsMember(choices));
    return option;
}

COption CCommand::AddFlag(const std::string& name, bool& value, const std::string& purpose) {
    return COption(*mApp->add_flag(name, value, purpose));
}

COption CCommand::Option(const std::string& name) const {
    return COption(*mApp->get_option(name));
}

void CCommand::OnCall(std::function<TStatus()> call) {
    mApp->callback([call = std::move(call), status = mStatus] { *status = call(); });
}

TStatus CCommand::Run(int argc, const char* const* argv) {
    try {
        mApp->parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return Report(*mApp, error, argc > 1 ? argv[1] : nullptr);
    }
    return *mStatus;
}

}  // namespace brindle::cli
