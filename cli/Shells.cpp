// SPDX-License-Identifier: MIT
// What is made from the declared commands: completions for shells, and man pages.

#include "cli/CommandLine.h"
#include "cli/Completions.h"
#include "cli/DidYouMean.h"
#include "cli/ManPage.h"
#include "cli/Message.h"

#include "brindle/Version.h"
#include "brindle/platform/AtomicFile.h"

#include <fmt/format.h>

#include <algorithm>
#include <filesystem>
#include <memory>

namespace brindle::cli {
namespace {

constexpr CCommandHelp kCompletionHelp{
    "completion",
    "Print what a shell reads to complete commands, options and their choices",
    "  brindle completion bash >~/.local/share/bash-completion/completions/brindle\n"
    "  brindle completion zsh >~/.zfunc/_brindle\n"
    "  brindle completion fish >~/.config/fish/completions/brindle.fish\n",
};

constexpr CCommandHelp kManualHelp{
    "manual",
    "Print the man page of the program or of a command, or write all of them",
    "  brindle manual analyse | man -l -\n"
    "  brindle manual markov learn | man -l -\n"
    "  brindle manual --folder ~/.local/share/man/man1\n",
};

struct CManualOptions {
    std::vector<std::string> mWords;
    std::string mFolder;
};

TStatus PrintCompletion(const CCommandPage& program, const std::string& shell) {
    if (shell == "bash") return Print(BashCompletion(program));
    return Print(shell == "zsh" ? ZshCompletion(program) : FishCompletion(program));
}

TStatus WriteManPages(const CCommandPage& program, const std::filesystem::path& folder) {
    for (const CCommandPage* const page : AllPages(program)) {
        const std::string path = (folder / ManPageFile(*page)).string();
        if (WriteFileAtomically(path, ManPage(*page, program, BrindleVersionString))) continue;
        return FailToWrite(path);
    }
    return TStatus::Success;
}

TStatus Manual(const CCommandPage& program, const CManualOptions& options) {
    if (!options.mFolder.empty()) return WriteManPages(program, options.mFolder);
    const std::string words = fmt::format("{}", fmt::join(options.mWords, " "));
    const std::string name = program.mName + (words.empty() ? "" : " ") + words;
    std::vector<std::string> names;
    for (const CCommandPage* const page : AllPages(program)) {
        if (page->mName == name || page->mOtherName == name) {
            return Print(ManPage(*page, program, BrindleVersionString));
        }
        names.push_back(page->WordsBelow());
    }
    std::string meant = NearestWord(words, names);
    const auto below = std::find_if(names.begin(), names.end(), [&](const std::string& command) {
        return !words.empty() && command.ends_with(' ' + words);
    });
    if (meant.empty() && below != names.end()) meant = *below;
    const std::string problem =
        Message("there is no command {command}", {{"command", Printable(name)}});
    return Fail(TStatus::BadUsage, WithMeant(problem, meant));
}

}  // namespace

void AddCompletion(CCommand& program) {
    CCommand& command = program.AddCommand(kCompletionHelp);
    const auto shell = std::make_shared<std::string>();
    command.AddChoiceArgument("SHELL", *shell, {"bash", "zsh", "fish"}, "The shell");
    command.OnCall([shell, &program] { return PrintCompletion(program.Page(), *shell); });
}

void AddManual(CCommand& program) {
    CCommand& command = program.AddCommand(kManualHelp);
    const auto options = std::make_shared<CManualOptions>();
    command.AddArgument("COMMAND", options->mWords, "The words of a command");
    command.AddOption("--folder", "FOLDER", options->mFolder, "Write the pages of all commands");
    command.OnCall([options, &program] { return Manual(program.Page(), *options); });
}

}  // namespace brindle::cli
