// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"

#include <memory>
#include <utility>

namespace brindle::cli {
namespace {

class CExamplesFirst : public CLI::Formatter {
public:
    explicit CExamplesFirst(std::string examples) : mExamples(std::move(examples)) {}

    std::string make_help(const CLI::App* app, std::string name,
                          CLI::AppFormatMode mode) const override {
        std::string help = CLI::Formatter::make_help(app, std::move(name), mode);
        if (mode == CLI::AppFormatMode::Sub) return help;
        return "Examples:\n" + mExamples + "\n" + help;
    }

private:
    std::string mExamples;
};

}  // namespace

CLI::App& AddCommand(CLI::App& program, const TCommandHelp& help) {
    CLI::App& command = *program.add_subcommand(help.mName, help.mPurpose);
    ShowExamplesFirst(command, help.mExamples);
    return command;
}

void ShowExamplesFirst(CLI::App& app, const std::string& examples) {
    const auto formatter = std::make_shared<CExamplesFirst>(examples);
    formatter->column_width(34);
    app.formatter(formatter);
}

void AddChoice(CLI::App& command, const std::string& name, std::string& value,
               const std::vector<std::string>& choices, const std::string& purpose) {
    std::string list;
    for (const std::string& choice : choices) list += (list.empty() ? "" : "|") + choice;
    command.add_option(name, value, purpose + " (default: " + value + ")")
        ->check(CLI::IsMember(choices))
        ->option_text(list);
}

void CFormatOptions::AddTo(CLI::App& command, const std::vector<std::string>& formats) {
    AddChoice(command, "--format", mFormat, formats, "Form of the output");
    command.add_flag("--json", mJson, "Short for --format json")
        ->excludes("--format")
        ->option_text(" ");
}

TFormat CFormatOptions::Format() const {
    if (mJson || mFormat == "json") return TFormat::Json;
    if (mFormat == "native") return TFormat::Native;
    if (mFormat == "chords") return TFormat::Chords;
    return mFormat == "svg" ? TFormat::Svg : TFormat::Text;
}

}  // namespace brindle::cli
