// SPDX-License-Identifier: MIT
#include "cli/CommandLine.h"
#include "cli/DataFolder.h"
#include "cli/Language.h"

#include "brindle/Version.h"

#include <fmt/format.h>

using namespace brindle::cli;

namespace {

constexpr const char* kExamples =
    "  brindle analyse \"Dm7 G7 | C\"\n"
    "  brindle analyse song.musicxml\n"
    "  brindle analyse --file song.txt --format svg >song.svg\n"
    "  brindle keys --file song.txt\n"
    "  brindle import song.musicxml --midi song.mid\n"
    "  brindle chord F#m7/C# Bb13\n"
    "  brindle function Dm7 G7 --key C\n"
    "  brindle numerals \"ii7 V7 I^7\" --key \"Eb major\"\n"
    "  brindle name E2 G3 C4\n"
    "  brindle scale \"D dorian\"\n"
    "  brindle key \"F# minor\" --json\n"
    "  brindle grid x32010\n"
    "  brindle markov learn -o model.json songs\n";

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
        return program.exit(error) == 0 ? TStatus::Success : TStatus::BadInput;
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

int main(int argc, char** argv) {
    UseLanguageOfUser();
    UseDataOfProgram();
    CLI::App program{"Music theory and harmony analysis", "brindle"};
    program.set_version_flag("--version", brindle::BrindleVersionString);
    program.require_subcommand(1);
    ShowExamplesFirst(program, kExamples);

    auto status = TStatus::Success;
    AddAnalyse(program, status);
    AddKeys(program, status);
    AddCopies(program, status);
    AddHarmonies(program, status);
    AddImport(program, status);
    AddChord(program, status);
    AddFunction(program, status);
    AddNumerals(program, status);
    AddVector(program, status);
    AddName(program, status);
    AddTypes(program, status);
    AddNet(program, status);
    AddScale(program, status);
    AddKey(program, status);
    AddGrid(program, status);
    AddGrids(program, status);
    AddMarkov(program, status);
    try {
        program.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        status = Report(program, error, argc > 1 ? argv[1] : nullptr);
    } catch (const std::exception& error) {
        status = Fail(TStatus::BadInput, error.what());
    }
    return static_cast<int>(status);
}
